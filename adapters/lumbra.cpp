#include "adapters/lumbra.h"

#include "daemon/kvd.h"
#include "routing/display.h"
#include "routing/keys.h"
#include "routing/silence.h"

namespace {

constexpr std::uint32_t kBeforeReturn = 10'000;  // microseconds

void Post(std::uint16_t keyCode, bool withShift = false) {
  PostKeyEvent(HostGetConstantString(Bundle::Lumbra), keyCode, withShift);
}

bool Nothing(std::int32_t) { return true; }

bool StartOrPause(std::int32_t) {
  if (AnyDisplayIsCaptured()) {
    Post(HostVirtualKey::Space);
    return true;
  }
  SilenceAllBut(App::Lumb);
  Post(HostVirtualKey::S, true);
  HostSleepMicroseconds(kBeforeReturn);
  Post(HostVirtualKey::Return);
  return true;
}

bool Exit(std::int32_t) {
  LumbraCommand_ExitSlideShow();
  return true;
}

/// Steps through the photos; the release is taken too.
template <std::uint16_t Arrow>
bool Step(std::int32_t value) {
  if (value != 0) Post(Arrow);
  return true;
}

/// Moves outside a slideshow; a release is not the application's.
template <std::uint16_t Arrow>
bool Move(std::int32_t value) {
  if (AnyDisplayIsCaptured() || value == 0) return false;
  Post(Arrow);
  return true;
}

struct Row {
  UsageKey key;
  bool (*rule)(std::int32_t value);
};

constexpr Row kButtons[] = {
    {Key::Undefined, Nothing},
    {Key::SystemAppMenu, Nothing},
    {Key::SystemMenuSelect, StartOrPause},
    {Key::SystemMenuRight, Step<HostVirtualKey::RightArrow>},
    {Key::SystemMenuLeft, Step<HostVirtualKey::LeftArrow>},
    {Key::SystemMenuUp, Move<HostVirtualKey::UpArrow>},
    {Key::SystemMenuDown, Move<HostVirtualKey::DownArrow>},
    {Key::Menu, Exit},
    {Key::MenuPick, Nothing},
    {Key::FastForward, Step<HostVirtualKey::RightArrow>},
    {Key::Rewind, Step<HostVirtualKey::LeftArrow>},
    {Key::Stop, Exit},
    {Key::PlayPause, StartOrPause},
};

}  // namespace

bool LumbraHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value) {
  const UsageKey key = UsageKeyOf(usagePage, usage);
  for (const Row& row : kButtons) {
    if (row.key == key) return row.rule(value);
  }
  return false;
}

void LumbraCommand_ExitSlideShow() {
  if (AnyDisplayIsCaptured()) Post(HostVirtualKey::Escape);
}
