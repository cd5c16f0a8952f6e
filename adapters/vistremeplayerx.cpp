#include "adapters/vistremeplayerx.h"

#include "adapters/button_table.h"
#include "registry/bridge.h"

namespace {

/// Whether the document played after the last play, pause, toggle or step back, or before the last scan
/// began.
bool sWasPlaying = false;

constexpr char kHUDPlay[] = R"(tell application id "com.tarn.VistremePlayerX"
tell front document to show remote hud
play front document
end tell)";

constexpr char kHUDPause[] = R"(tell application id "com.tarn.VistremePlayerX"
tell front document to show remote hud
pause front document
end tell)";

constexpr char kPlaying[] =
    R"(tell application id "com.tarn.VistremePlayerX" to get playing of front document)";
constexpr char kRate[] = R"(tell application id "com.tarn.VistremePlayerX" to get rate of front document)";

constexpr char kScanForward[] = R"(tell application id "com.tarn.VistremePlayerX"
tell front document to show remote hud
set rate of front document to 2.0
end tell)";

constexpr char kScanBackward[] = R"(tell application id "com.tarn.VistremePlayerX"
tell front document to show remote hud
set rate of front document to -2.0
end tell)";

constexpr char kForwardLadder[] = R"(tell application id "com.tarn.VistremePlayerX"
set maxRate to 8.0
set scanRate to rate of front document
tell front document to show remote hud
if scanRate is greater than 1.0 then
if scanRate is maxRate then
set rate of front document to 2.0
else
set rate of front document to scanRate * 2
end if
else if scanRate is less than 0.0 then
if scanRate is -2.0 then
set rate of front document to 1.0
else
set rate of front document to scanRate / 2
end if
else
step forward front document
end if
end tell)";

constexpr char kBackwardLadder[] = R"(tell application id "com.tarn.VistremePlayerX"
set maxRate to -8.0
set scanRate to rate of front document
tell front document to show remote hud
if scanRate is less than 0.0 then
if scanRate is maxRate then
set rate of front document to -2.0
else
set rate of front document to scanRate * 2
end if
else if scanRate is greater than 1.0 then
set rate of front document to scanRate / 2
else
step backward front document
end if
end tell)";

/// Standing or playing normally, by the rate without its fraction. Unsigned, so that every backward rate is
/// not.
bool AtNormalRate(std::int32_t rate) { return static_cast<std::uint32_t>(rate) < 2; }

void Scan(bool pressed, const char* firstScan, const char* ladder) {
  const std::int32_t rate = VistremePlayerX_GetScanRate();
  if (!pressed) return;
  if (!AtNormalRate(rate)) return HandleScript(ladder);
  sWasPlaying = VistremePlayerX_IsPlaying();
  HandleScript(firstScan);
}

constexpr ButtonRow kButtons[] = {
    {Key::SystemMenuSelect, SilenceThen<App::VstX, VistremeXCommand_PlayOrPause>, true},
    {Key::SystemMenuRight, Run<VistremeXCommand_Right>, false},
    {Key::SystemMenuLeft, Run<VistremeXCommand_Left>, false},
    {Key::MenuPick, Swallow, true},
    {Key::Play, SilenceThen<App::VstX, VistremeXCommand_PlayOrPause>, true},
    {Key::Pause, Run<VistremeXCommand_Pause>, true},
    {Key::FastForward, RunHeld<VistremeXCommand_FastForward>, true},
    {Key::Rewind, RunHeld<VistremeXCommand_Rewind>, true},
    {Key::ScanNextTrack, Run<VistremeXCommand_NextTrack>, true},
    {Key::ScanPreviousTrack, Run<VistremeXCommand_BackTrack>, true},
    {Key::Stop, Run<VistremeXCommand_Stop>, true},
    {Key::PlayPause, SilenceThen<App::VstX, VistremeXCommand_PlayOrPause>, true},
};

}  // namespace

bool VistremePlayerXHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value) {
  return HandleButton(kButtons, UsageKeyOf(usagePage, usage), value);
}

void VistremeXCommand_FullScreenMode() {}

// This text speaks of the sound volume, the next of the audio volume: the document has both words.
void VistremeXCommand_VolumeDown() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayerX"
set theVolume to (sound volume of front document) - 0.0625
if theVolume < 0 then set theVolume to 0
set sound volume of front document to theVolume
end tell)");
}

void VistremeXCommand_VolumeUp() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayerX"
set theVolume to (audio volume of front document) + 0.0625
if theVolume > 1 then set theVolume to 1
set audio volume of front document to theVolume
end tell)");
}

void VistremeXCommand_NextTrack() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayerX"
tell front document to show remote hud
step forward front document
end tell)");
}

void VistremeXCommand_Left() { HandleScript(kBackwardLadder); }

void VistremeXCommand_Right() { HandleScript(kForwardLadder); }

void VistremeXCommand_Resume() {
  HandleScript(sWasPlaying ? R"(tell application id "com.tarn.VistremePlayerX"
tell front document to show remote hud
set rate of front document to 1.0
end tell)"
                           : R"(tell application id "com.tarn.VistremePlayerX"
tell front document to show remote hud
set rate of front document to 0.0
end tell)");
}

void VistremeXCommand_Stop() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayerX" to stop front document)");
}

void VistremeXCommand_Activate() {
  HandleScript(R"(tell application id "com.tarn.VistremePlayerX" to activate)");
}

void VistremeXCommand_Pause() {
  HandleScript(kHUDPause);
  sWasPlaying = VistremePlayerX_IsPlaying();
}

void VistremeXCommand_Play() {
  HandleScript(kHUDPlay);
  sWasPlaying = VistremePlayerX_IsPlaying();
}

void VistremeXCommand_BackTrack() {
  sWasPlaying = VistremePlayerX_IsPlaying();
  HandleScript(R"(tell application id "com.tarn.VistremePlayerX"
tell front document to show remote hud
step backward front document
end tell)");
  if (sWasPlaying) VistremeXCommand_Play();
}

void VistremeXCommand_Rewind(bool pressed) { Scan(pressed, kScanBackward, kBackwardLadder); }

void VistremeXCommand_FastForward(bool pressed) { Scan(pressed, kScanForward, kForwardLadder); }

void VistremeXCommand_PlayOrPause() {
  if (!AtNormalRate(VistremePlayerX_GetScanRate())) {
    return sWasPlaying ? VistremeXCommand_Play() : VistremeXCommand_Pause();
  }
  HandleScript(R"(tell application id "com.tarn.VistremePlayerX"
set frontMovie to front document
tell front document to show remote hud
if frontMovie is playing then
pause frontMovie
else
play frontMovie
end if
end tell)");
}

bool VistremePlayerX_IsPlaying() { return HandleScriptWithIntegerResult(kPlaying) != 0; }

std::int32_t VistremePlayerX_GetScanRate() {
  return static_cast<std::int32_t>(HandleScriptWithIntegerResult(kRate));
}

std::int32_t VistremePlayerX_GetVolume() {
  const auto volume = static_cast<double>(HandleScriptWithIntegerResult(
      R"(tell application id "com.tarn.VistremePlayerX" to get audio volume of front document)"));
  return static_cast<std::int32_t>(volume * 0.00390625 * 100.0);
}
