#include "adapters/spindle.h"

#include "adapters/button_table.h"
#include "registry/bridge.h"
#include "routing/retrigger.h"
#include "routing/volume.h"

namespace {

constexpr FourCharCode kStatePlaying = FourCC("espl");
constexpr FourCharCode kStatePaused = FourCC("espa");
constexpr FourCharCode kStateStopped = FourCC("esps");

constexpr double kMenuRepeatPeriod = 0.01;   // seconds
constexpr double kMenuRepeatDuration = 0.0;  // no limit

/// Whether the disc stood paused when the last scan began.
bool sWasPaused = false;

constexpr char kChapterBack[] = R"(tell application id "com.tarn.Spindle"
if chapter > 1 then
set chapter to chapter - 1
else if elapsed time > 5 then
set chapter to 1
else
go to main menu
end if
end tell)";

constexpr char kChapterNext[] = R"(tell application id "com.tarn.Spindle"
if chapter < available chapters then
set chapter to chapter + 1
else
go to main menu
end if
end tell)";

constexpr char kPlayOrPause[] = R"(tell application id "com.tarn.Spindle"
if dvd state is playing then
pause dvd
else
play dvd
end if
end)";

constexpr char kScanBack[] = R"(tell application id "com.tarn.Spindle"
set scanRate to dvd scan rate
set dvd scan rate to x8
rewind dvd
set dvd scan rate to scanRate
end tell)";

constexpr char kScanForward[] = R"(tell application id "com.tarn.Spindle"
set scanRate to dvd scan rate
set dvd scan rate to x8
fast forward dvd
set dvd scan rate to scanRate
end tell)";

constexpr char kMenuActive[] = R"(tell application id "com.tarn.Spindle" to get dvd menu active)";
constexpr char kState[] = R"(tell application id "com.tarn.Spindle" to get dvd state)";
constexpr char kPressEnter[] = R"(tell application id "com.tarn.Spindle" to press enter key)";
constexpr char kReturnToDVD[] = R"(tell application id "com.tarn.Spindle" to go return to dvd)";

void Scan(bool pressed, const char* script) {
  if (!pressed) return DVDCommand_Resume();
  sWasPaused = Spindle_IsPaused();
  HandleScript(script);
}

// ---- Buttons whose meaning depends on the menu ----

void SelectOrPlay() {
  const bool atMenu = Spindle_AtMenu();
  SilenceAllBut(App::Spin);
  HandleScript(atMenu ? kPressEnter : kPlayOrPause);
}

void SelectAtMenu() {
  if (Spindle_AtMenu()) DVDCommand_Select();
}

void PlayOrPauseOutsideMenu() {
  if (!Spindle_AtMenu()) DVDCommand_PlayOrPause();
}

void FastForward(bool pressed) {
  Spindle_AtMenu() ? DVDCommand_AmbiguousFastForward(pressed) : DVDCommand_FastForward(pressed);
}

void Rewind(bool pressed) {
  Spindle_AtMenu() ? DVDCommand_AmbiguousRewind(pressed) : DVDCommand_Rewind(pressed);
}

constexpr ButtonRow kButtons[] = {
    {Key::SystemAppMenu, Run<DVDCommand_DVDMenu>, true},
    {Key::SystemMenuSelect, Run<SelectOrPlay>, true},
    {Key::SystemMenuRight, Run<DVDCommand_AmbiguousRightArrow>, true},
    {Key::SystemMenuLeft, Run<DVDCommand_AmbiguousLeftArrow>, true},
    {Key::SystemMenuUp, Run<DVDCommand_MenuUp>, true},
    {Key::SystemMenuDown, Run<DVDCommand_MenuDown>, true},
    {Key::MenuPick, Run<SelectAtMenu>, true},
    {Key::MenuUp, Run<DVDCommand_MenuUp>, true},
    {Key::MenuDown, Run<DVDCommand_MenuDown>, true},
    {Key::MenuLeft, Run<DVDCommand_MenuLeft>, true},
    {Key::MenuRight, Run<DVDCommand_MenuRight>, true},
    {Key::Play, Run<DVDCommand_PlayOrPause>, true},
    {Key::Pause, Run<DVDCommand_Pause>, true},
    {Key::FastForward, RunHeld<FastForward>, true},
    {Key::Rewind, RunHeld<Rewind>, true},
    {Key::ScanNextTrack, Run<DVDCommand_NextTrack>, true},
    {Key::ScanPreviousTrack, Run<DVDCommand_BackTrack>, true},
    {Key::Stop, Run<DVDCommand_Stop>, true},
    {Key::PlayPause, Run<PlayOrPauseOutsideMenu>, true},
};

// ---- The outer layer ----

void ChangeVolume(std::int32_t value, void (*change)(std::int32_t value)) {
  if (value != 0) DVDCommand_Unmute();
  change(value);
}

void StepOrChangeVolume(PackedHIDEvent event, std::int32_t value, void (*step)(),
                        void (*change)(std::int32_t value)) {
  if (!Spindle_AtMenu()) return ChangeVolume(value, change);
  if (value == 0) return;
  step();
  retrigger(UnpackHIDEvent(event), value, kMenuRepeatPeriod, kMenuRepeatDuration);
}

}  // namespace

bool dispatchToSpindle(PackedHIDEvent event, std::int32_t value) {
  event &= kPackedHIDEventMask;
  switch (UsageKeyOf(event)) {
    case Key::SystemMenuUp:
      StepOrChangeVolume(event, value, DVDCommand_MenuUp, dispatchVolumeUpCommand);
      return true;
    case Key::SystemMenuDown:
      StepOrChangeVolume(event, value, DVDCommand_MenuDown, dispatchVolumeDownCommand);
      return true;
    case Key::VolumeIncrement:
      ChangeVolume(value, dispatchVolumeUpCommand);
      return true;
    case Key::VolumeDecrement:
      ChangeVolume(value, dispatchVolumeDownCommand);
      return true;
    default:
      return SpindleHandleHIDEvent(UsagePageOf(event), UsageOf(event), value);
  }
}

bool SpindleHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value) {
  return HandleButton(kButtons, UsageKeyOf(usagePage, usage), value);
}

void DVDCommand_AmbiguousFastForward(bool pressed) {
  if (pressed) HandleScript(R"(tell application id "com.tarn.Spindle" to fast forward dvd)");
}

void DVDCommand_AmbiguousRewind(bool pressed) {
  if (pressed) HandleScript(R"(tell application id "com.tarn.Spindle" to rewind dvd)");
}

void DVDCommand_Unmute() {
  HandleScript(R"(tell application id "com.tarn.Spindle" to set audio muted to false)");
}

void DVDCommand_VolumeDown() {
  HandleScript(R"(tell application id "com.tarn.Spindle"
set audio volume to audio volume - 16
end)");
}

void DVDCommand_VolumeUp() {
  HandleScript(R"(tell application id "com.tarn.Spindle"
set audio volume to audio volume + 16
end)");
}

void DVDCommand_BackTrack() { HandleScript(kChapterBack); }

void DVDCommand_NextTrack() { HandleScript(kChapterNext); }

void DVDCommand_Resume() {
  HandleScript(sWasPaused ? R"(tell application id "com.tarn.Spindle" to pause dvd)"
                          : R"(tell application id "com.tarn.Spindle" to play dvd)");
}

void DVDCommand_ResumePlaying() { HandleScript(kReturnToDVD); }

void DVDCommand_Stop() { HandleScript(R"(tell application id "com.tarn.Spindle" to stop dvd)"); }

void DVDCommand_Pause() { HandleScript(R"(tell application id "com.tarn.Spindle" to pause dvd)"); }

void DVDCommand_HideController() {
  HandleScript(R"(tell application id "com.tarn.Spindle" to set controller visibility to false)");
}

void DVDCommand_SetSubtitles(bool on) {
  HandleScript(on ? R"(tell application id "com.tarn.Spindle" to set displaying subtitle to true)"
                  : R"(tell application id "com.tarn.Spindle" to set displaying subtitle to false)");
}

void DVDCommand_FullScreenMode() {
  HandleScript(R"(tell application id "com.tarn.Spindle" to set viewer full screen to true)");
}

void DVDCommand_MenuRight() {
  HandleScript(R"(tell application id "com.tarn.Spindle" to press right arrow key)");
}

void DVDCommand_MenuLeft() {
  HandleScript(R"(tell application id "com.tarn.Spindle" to press left arrow key)");
}

void DVDCommand_MenuDown() {
  HandleScript(R"(tell application id "com.tarn.Spindle" to press down arrow key)");
}

void DVDCommand_MenuUp() { HandleScript(R"(tell application id "com.tarn.Spindle" to press up arrow key)"); }

void DVDCommand_Activate() { HandleScript(R"(tell application id "com.tarn.Spindle" to activate)"); }

void DVDCommand_PlayFromBeginning() {
  SilenceAllBut(App::Spin);
  HandleScript(R"(tell application id "com.tarn.Spindle"
go to beginning of disc
play dvd
end tell)");
}

void DVDCommand_PlayOrPause() {
  SilenceAllBut(App::Spin);
  HandleScript(kPlayOrPause);
}

void DVDCommand_Play() {
  SilenceAllBut(App::Spin);
  HandleScript(R"(tell application id "com.tarn.Spindle" to play dvd)");
}

void DVDCommand_Select() {
  SilenceAllBut(App::Spin);
  HandleScript(kPressEnter);
}

void DVDCommand_AmbiguousRightArrow() { Spindle_AtMenu() ? DVDCommand_MenuRight() : DVDCommand_NextTrack(); }

void DVDCommand_AmbiguousLeftArrow() { Spindle_AtMenu() ? DVDCommand_MenuLeft() : DVDCommand_BackTrack(); }

void DVDCommand_DVDMenu() {
  SilenceAllBut(App::Spin);
  if (Spindle_AtMenu()) return DVDCommand_ResumePlaying();
  const FourCharCode state = Spindle_GetPlayerState();
  const bool discIsIn = state == kStatePaused || state == kStatePlaying || state == kStateStopped;
  HandleScript(discIsIn ? R"(tell application id "com.tarn.Spindle" to go to main menu)"
                        : R"(tell application id "com.tarn.Spindle" to go to beginning of disc)");
}

void DVDCommand_Rewind(bool pressed) { Scan(pressed, kScanBack); }

void DVDCommand_FastForward(bool pressed) { Scan(pressed, kScanForward); }

bool Spindle_DisplayingSubtitles() {
  return HandleScriptWithIntegerResult(
             R"(tell application id "com.tarn.Spindle" to get displaying subtitle)") != 0;
}

bool Spindle_HasMedia() {
  return HandleScriptWithIntegerResult(R"(tell application id "com.tarn.Spindle" to get has media)") != 0;
}

bool Spindle_AtMenu() { return HandleScriptWithIntegerResult(kMenuActive) != 0; }

std::int32_t Spindle_GetVolume() {
  const auto volume = static_cast<double>(
      HandleScriptWithIntegerResult(R"(tell application id "com.tarn.Spindle" to get audio volume)"));
  return static_cast<std::int32_t>(volume / 255.0 * 100.0);
}

FourCharCode Spindle_GetPlayerState() { return HandleScriptWithOSTypeResult(kState); }

bool Spindle_IsPaused() { return Spindle_GetPlayerState() == kStatePaused; }

bool Spindle_IsPlaying() { return Spindle_GetPlayerState() == kStatePlaying; }

FourCharCode Spindle_GetActiveMenu() {
  return HandleScriptWithOSTypeResult(R"(tell application id "com.tarn.Spindle" to get active dvd menu)");
}
