#include "adapters/vistremeplayer.h"

#include "adapters/button_table.h"
#include "registry/bridge.h"

namespace {

/// Whether the front movie played when the last scan button was pressed.
bool sWasPlaying = false;

void Scan(bool pressed, const char* script) {
  if (!pressed) return VistremeCommand_Resume();
  sWasPlaying = VistremePlayer_IsPlaying();
  HandleScript(script);
}

constexpr ButtonRow kButtons[] = {
    {Key::SystemMenuSelect, SilenceThen<App::Vist, VistremeCommand_PlayOrPause>, true},
    {Key::SystemMenuRight, Run<VistremeCommand_NextTrack>, true},
    {Key::SystemMenuLeft, Run<VistremeCommand_BackTrack>, true},
    {Key::MenuPick, Swallow, true},
    {Key::Play, SilenceThen<App::Vist, VistremeCommand_PlayOrPause>, true},
    {Key::Pause, Run<VistremeCommand_Pause>, true},
    {Key::FastForward, RunHeld<VistremeCommand_FastForward>, true},
    {Key::Rewind, RunHeld<VistremeCommand_Rewind>, true},
    {Key::ScanNextTrack, Run<VistremeCommand_NextTrack>, true},
    {Key::ScanPreviousTrack, Run<VistremeCommand_BackTrack>, true},
    {Key::Stop, Run<VistremeCommand_Stop>, true},
    {Key::PlayPause, SilenceThen<App::Vist, VistremeCommand_PlayOrPause>, true},
};

}  // namespace

bool VistremePlayerHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value) {
  return HandleButton(kButtons, UsageKeyOf(usagePage, usage), value);
}

void VistremeCommand_VolumeDown() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayer"
set theVolume to (sound volume of front movie) - 16
if theVolume < 0 then set theVolume to 0
set sound volume of front movie to theVolume
end tell)");
}

void VistremeCommand_VolumeUp() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayer"
set theVolume to (sound volume of front movie) + 16
if theVolume > 256 then set theVolume to 256
set sound volume of front movie to theVolume
end tell)");
}

void VistremeCommand_BackTrack() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayer" to step backward front movie)");
}

void VistremeCommand_NextTrack() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayer" to step forward front movie)");
}

void VistremeCommand_Resume() {
  HandleScript(sWasPlaying
                   ? R"(tell application id "com.tarn.VistremePlayer" to set rate of front movie to 1.0)"
                   : R"(tell application id "com.tarn.VistremePlayer" to set rate of front movie to 0.0)");
}

void VistremeCommand_Stop() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayer" to stop front movie)");
}

void VistremeCommand_Pause() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayer" to pause front movie)");
}

void VistremeCommand_PlayOrPause() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayer"
set frontMovie to front movie
if frontMovie is playing then
pause frontMovie
else
play frontMovie
end if
end tell)");
}

// The text reads a variable that it never sets, and so always fails; kept as it is.
void VistremeCommand_Play() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayer" to play frontMovie)");
}

void VistremeCommand_FullScreenMode() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayer" to set viewer full screen to true)");
}

void VistremeCommand_Activate() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayer" to activate)");
}

void VistremeCommand_Rewind(bool pressed) {
  Scan(pressed, R"(tell application id "com.tarn.VistremePlayer" to set rate of front movie to -2.0)");
}

void VistremeCommand_FastForward(bool pressed) {
  Scan(pressed, R"(tell application id "com.tarn.VistremePlayer" to set rate of front movie to 2.0)");
}

bool VistremePlayer_IsPlaying() {
  // The doubled word belongs to the text.
  return HandleScriptWithIntegerResult(
             R"(tell application id "com.tarn.VistremePlayer" to get get playing of front movie)") != 0;
}

std::int32_t VistremePlayer_GetVolume() {
  const auto volume = static_cast<double>(HandleScriptWithIntegerResult(
      R"(tell application id "com.tarn.VistremePlayer" to get sound volume of front movie)"));
  return static_cast<std::int32_t>(volume * 0.00390625 * 100.0);
}
