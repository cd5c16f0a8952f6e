#include "adapters/slidewell.h"

#include "adapters/button_table.h"
#include "registry/bridge.h"

namespace {

/// Runs a command when the value is greater than zero: a negative one counts as pressed everywhere else, not
/// here.
template <void (*Command)()>
void RunAboveZero(std::int32_t value) {
  if (value > 0) Command();
}

constexpr ButtonRow kSwitcherButtons[] = {
    {Key::SystemAppMenu, Run<SlidewellCommand_CancelSlideSwitcher>, true},
    {Key::SystemMenuSelect, Run<SlidewellCommand_AcceptSlideSwitcher>, true},
    {Key::SystemMenuRight, Run<SlidewellCommand_SlideSwitcherForward>, true},
    {Key::SystemMenuLeft, Run<SlidewellCommand_SlideSwitcherBackward>, true},
    {Key::Menu, Run<SlidewellCommand_StopPresentation>, true},
    {Key::MenuPick, Run<SlidewellCommand_AcceptSlideSwitcher>, true},
    {Key::MenuLeft, Run<SlidewellCommand_SlideSwitcherBackward>, true},
    {Key::MenuRight, Run<SlidewellCommand_SlideSwitcherForward>, true},
    {Key::Play, Run<SlidewellCommand_AcceptSlideSwitcher>, true},
    {Key::ScanNextTrack, Run<SlidewellCommand_SlideSwitcherForward>, true},
    {Key::ScanPreviousTrack, Run<SlidewellCommand_SlideSwitcherBackward>, true},
    {Key::Stop, Run<SlidewellCommand_StopPresentation>, true},
    {Key::PlayPause, Run<SlidewellCommand_AcceptSlideSwitcher>, true},
};

constexpr ButtonRow kPlayingButtons[] = {
    {Key::SystemAppMenu, Run<SlidewellCommand_ShowSlideSwitcher>, true},
    {Key::SystemMenuSelect, Run<SlidewellCommand_ToggleFreeze>, true},
    {Key::SystemMenuRight, Run<SlidewellCommand_NextSlide>, true},
    {Key::SystemMenuLeft, Run<SlidewellCommand_PreviousSlide>, true},
    {Key::Menu, Run<SlidewellCommand_StopPresentation>, true},
    {Key::MenuPick, Run<SlidewellCommand_NextSlide>, true},
    {Key::MenuLeft, Run<SlidewellCommand_PreviousSlide>, true},
    {Key::MenuRight, Run<SlidewellCommand_NextSlide>, true},
    {Key::Play, Run<SlidewellCommand_NextSlide>, true},
    {Key::FastForward, RunAboveZero<SlidewellCommand_JumpToEnd>, true},
    {Key::Rewind, RunAboveZero<SlidewellCommand_JumpToStart>, true},
    {Key::ScanNextTrack, Run<SlidewellCommand_NextSlide>, true},
    {Key::ScanPreviousTrack, Run<SlidewellCommand_PreviousSlide>, true},
    {Key::Stop, Run<SlidewellCommand_StopPresentation>, true},
    {Key::PlayPause, Run<SlidewellCommand_ToggleFreeze>, true},
};

constexpr ButtonRow kIdleButtons[] = {
    {Key::SystemMenuSelect, Run<SlidewellCommand_StartPresentation>, true},
    {Key::Play, Run<SlidewellCommand_StartPresentation>, true},
    {Key::PlayPause, Run<SlidewellCommand_StartPresentation>, true},
    {Key::MenuPick, Swallow, true},
};

}  // namespace

bool SlidewellHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value) {
  const UsageKey key = UsageKeyOf(usagePage, usage);
  if (Slidewell_SlideSwitcherVisible()) return HandleButton(kSwitcherButtons, key, value);
  if (Slidewell_IsPlaying()) return HandleButton(kPlayingButtons, key, value);
  return HandleButton(kIdleButtons, key, value);
}

void SlidewellCommand_ToggleFreeze() {
  HandleScript(R"(tell application id "com.tarn.officra.Slidewell"
if frozen then
set frozen to false
else
set frozen to true
end if
end tell)");
}

void SlidewellCommand_SlideSwitcherBackward() {
  HandleScript(R"(tell application id "com.tarn.officra.Slidewell" to move slide switcher backward)");
}

void SlidewellCommand_SlideSwitcherForward() {
  HandleScript(R"(tell application id "com.tarn.officra.Slidewell" to move slide switcher forward)");
}

void SlidewellCommand_AcceptSlideSwitcher() {
  HandleScript(R"(tell application id "com.tarn.officra.Slidewell" to accept slide switcher)");
}

void SlidewellCommand_CancelSlideSwitcher() {
  HandleScript(R"(tell application id "com.tarn.officra.Slidewell" to cancel slide switcher)");
}

void SlidewellCommand_ShowSlideSwitcher() {
  HandleScript(R"(tell application id "com.tarn.officra.Slidewell" to show slide switcher)");
}

void SlidewellCommand_JumpToEnd() {
  HandleScript(R"(tell application id "com.tarn.officra.Slidewell" to show last slide of first slideshow)");
}

void SlidewellCommand_JumpToStart() {
  HandleScript(R"(tell application id "com.tarn.officra.Slidewell" to show first slide of first slideshow)");
}

void SlidewellCommand_PreviousSlide() {
  HandleScript(R"(tell application id "com.tarn.officra.Slidewell" to show previous slide)");
}

void SlidewellCommand_NextSlide() {
  HandleScript(R"(tell application id "com.tarn.officra.Slidewell" to show next slide)");
}

void SlidewellCommand_StopPresentation() {
  HandleScript(R"(tell application id "com.tarn.officra.Slidewell" to stop slideshow)");
}

void SlidewellCommand_Activate() {
  HandleScript(R"(tell application id "com.tarn.officra.Slidewell" to activate)");
}

void SlidewellCommand_StartPresentation() {
  SilenceAllBut(App::Slid);
  HandleScript(R"(tell application id "com.tarn.officra.Slidewell" to start slideshow)");
}

bool Slidewell_SlideSwitcherVisible() {
  return HandleScriptWithIntegerResult(
             R"(tell application id "com.tarn.officra.Slidewell" to get slide switcher visible)") != 0;
}

bool Slidewell_IsPlaying() {
  return HandleScriptWithIntegerResult(
             R"(tell application id "com.tarn.officra.Slidewell" to get playing)") != 0;
}
