#include "adapters/snapvale.h"

#include "adapters/snapvale_scripts.h"
#include "daemon/kvd.h"
#include "registry/bridge.h"
#include "registry/registry.h"
#include "routing/display.h"
#include "routing/keys.h"
#include "routing/silence.h"

namespace {

namespace scripts = snapvale_scripts;

/// What is asked of the application at every button.
struct Situation {
  std::int32_t version;
  /// A slideshow runs; asked of version 8 and later only.
  bool running;

  bool isModern() const { return version > 7; }
};

void Post(std::uint16_t keyCode) { PostKeyEvent(HostGetConstantString(Bundle::Snapvale), keyCode, false); }

bool Nothing(const Situation&) { return true; }

bool Play(const Situation& situation) {
  if (AnyDisplayIsCaptured()) {
    Post(HostVirtualKey::Space);
    return true;
  }
  SilenceAllBut(App::Snap);
  if (!situation.isModern()) {
    HandleScript(scripts::kStartWithoutWaiting);
  } else {
    HandleScript(situation.running ? scripts::kSpace : scripts::kStart);
  }
  return true;
}

bool Menu(const Situation& situation) {
  if (!situation.isModern()) {
    if (!AnyDisplayIsCaptured()) return Play(situation);
    Post(HostVirtualKey::Return);
    return true;
  }
  if (AnyDisplayIsCaptured()) {
    Post(HostVirtualKey::Escape);
    return true;
  }
  SilenceAllBut(App::Snap);
  if (situation.running) HandleScript(scripts::kEscape);
  return true;
}

/// An arrow key in a show, a walk to another album outside.
bool Step(const Situation& situation, std::uint16_t arrow, const scripts::Generations& album) {
  // A modern show is known by its own word, an older one by the display it has taken.
  if (situation.isModern() ? situation.running : AnyDisplayIsCaptured()) {
    Post(arrow);
  } else if (situation.isModern()) {
    HandleScript(album.version8);
  } else {
    HandleScript(situation.version == 7 ? album.version7 : album.version6);
  }
  return true;
}

bool Next(const Situation& situation) {
  return Step(situation, HostVirtualKey::RightArrow, scripts::kNextAlbum);
}

bool Previous(const Situation& situation) {
  return Step(situation, HostVirtualKey::LeftArrow, scripts::kPreviousAlbum);
}

bool AppMenu(const Situation& situation) {
  const bool captured = AnyDisplayIsCaptured();
  if (!situation.isModern() || captured) return captured;
  if (situation.running) return false;
  HandleScript(scripts::kCommandEscape);
  return true;
}

struct Row {
  UsageKey key;
  bool (*rule)(const Situation& situation);
};

constexpr Row kButtons[] = {
    {Key::SystemAppMenu, AppMenu},
    {Key::SystemMenuSelect, Play},
    {Key::SystemMenuRight, Next},
    {Key::SystemMenuLeft, Previous},
    {Key::Menu, Menu},
    {Key::MenuPick, Nothing},
    {Key::MenuLeft, Previous},
    {Key::MenuRight, Next},
    {Key::Play, Play},
    {Key::Pause, Play},
    {Key::FastForward, Nothing},
    {Key::Rewind, Nothing},
    {Key::ScanNextTrack, Next},
    {Key::ScanPreviousTrack, Previous},
    {Key::Stop, Menu},
    {Key::PlayPause, Play},
};

}  // namespace

bool SnapvaleHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t) {
  Situation situation{getSnapvaleVersion(), false};
  if (situation.isModern()) situation.running = SnapvaleSlideShowPlaying() != 0;
  const UsageKey key = UsageKeyOf(usagePage, usage);
  for (const Row& row : kButtons) {
    if (row.key == key) return row.rule(situation);
  }
  return false;
}

std::int32_t SnapvaleSlideShowPlaying() {
  return static_cast<std::int32_t>(HandleScriptWithIntegerResult(scripts::kSlideshowRunning));
}
