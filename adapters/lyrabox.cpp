#include "adapters/lyrabox.h"

#include "adapters/button_table.h"
#include "registry/bridge.h"

namespace {

constexpr FourCharCode kHookClass = FourCC("hook");
constexpr FourCharCode kRemoteSelectEvent = FourCC("RSel");
constexpr FourCharCode kPlayerStatePlaying = FourCC("kPSP");

}  // namespace

void LyraboxCommand_Select() {
  HandleTarnEventWithCode(HostGetConstantString(Bundle::Lyrabox), kHookClass, kRemoteSelectEvent);
}

// This text names the application without the word "id", unlike all the others.
void LyraboxCommand_VolumeDown() {
  HandleScript(R"(tell application "com.tarn.Lyrabox"
set sound volume to sound volume - 2
end)");
}

void LyraboxCommand_VolumeUp() {
  HandleScript(R"(tell application id "com.tarn.Lyrabox"
set sound volume to sound volume + 2
end)");
}

void LyraboxCommand_BackTrack() { HandleScript(R"(tell application id "com.tarn.Lyrabox" to back track)"); }

void LyraboxCommand_NextTrack() { HandleScript(R"(tell application id "com.tarn.Lyrabox" to next track)"); }

void LyraboxCommand_Resume() { HandleScript(R"(tell application id "com.tarn.Lyrabox" to resume)"); }

void LyraboxCommand_Rewind(bool pressed) {
  if (!pressed) return LyraboxCommand_Resume();
  HandleScript(R"(tell application id "com.tarn.Lyrabox" to rewind)");
}

void LyraboxCommand_FastForward(bool pressed) {
  if (!pressed) return LyraboxCommand_Resume();
  HandleScript(R"(tell application id "com.tarn.Lyrabox" to fast forward)");
}

void LyraboxCommand_Stop() { HandleScript(R"(tell application id "com.tarn.Lyrabox" to stop)"); }

void LyraboxCommand_Pause() {
  HandleScript(R"(tell application id "com.tarn.Lyrabox"
if player state is playing then
pause
end if
end)");
}

void LyraboxCommand_PlayOrPause() { HandleScript(R"(tell application id "com.tarn.Lyrabox" to playpause)"); }

FourCharCode LyraboxPlayerState() {
  return HandleScriptWithOSTypeResult(R"(tell application id "com.tarn.Lyrabox" to get player state)");
}

bool LyraboxIsPlaying() { return LyraboxPlayerState() == kPlayerStatePlaying; }

namespace {

constexpr ButtonRow kButtons[] = {
    {Key::SystemMenuSelect, SilenceThen<App::Lyra, LyraboxCommand_PlayOrPause>, true},
    {Key::SystemMenuRight, Run<LyraboxCommand_NextTrack>, true},
    {Key::SystemMenuLeft, Run<LyraboxCommand_BackTrack>, true},
    {Key::MenuPick, SilenceThen<App::Lyra, LyraboxCommand_Select>, true},
    {Key::MenuLeft, Run<LyraboxCommand_BackTrack>, true},
    {Key::MenuRight, Run<LyraboxCommand_NextTrack>, true},
    {Key::Play, SilenceThen<App::Lyra, LyraboxCommand_PlayOrPause>, true},
    {Key::Pause, Run<LyraboxCommand_Pause>, true},
    {Key::FastForward, RunHeld<LyraboxCommand_FastForward>, true},
    {Key::Rewind, RunHeld<LyraboxCommand_Rewind>, true},
    {Key::ScanNextTrack, Run<LyraboxCommand_NextTrack>, true},
    {Key::ScanPreviousTrack, Run<LyraboxCommand_BackTrack>, true},
    {Key::Stop, Run<LyraboxCommand_Stop>, true},
    {Key::PlayPause, SilenceThen<App::Lyra, LyraboxCommand_PlayOrPause>, true},
};

}  // namespace

bool LyraboxHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value) {
  return HandleButton(kButtons, UsageKeyOf(usagePage, usage), value);
}
