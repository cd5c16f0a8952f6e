#include "platform/linux/windows/gnome/gnome.h"

#include <algorithm>
#include <cstdlib>

#include "platform/linux/windows/gnome/keyboard.h"
#include "platform/linux/windows/gnome/shell.h"

namespace linux::windows::gnome {

namespace {

std::vector<Window> sWindows;
/// shellChanges() when they were taken over.
unsigned sChanges = 0;

/// Under X11 the X server knows all that the shell does.
bool isOnWayland() { return std::getenv("WAYLAND_DISPLAY") != nullptr; }

bool open() { return isOnWayland() && takeInShell() != Shell::None; }

bool takeIn() {
  open();
  if (sChanges == shellChanges()) return false;
  sChanges = shellChanges();
  sWindows = windowsTold();
  for (Window& window : sWindows) window.id.backend = &kBackend;
  return true;
}

const Window* find(std::uint64_t number) {
  const auto& told = windowsTold();
  const auto found = std::ranges::find(told, number, [](const Window& window) { return window.id.number; });
  return found != told.end() ? &*found : nullptr;
}

void look(std::span<Window> windows) {
  open();
  for (Window& window : windows) {
    const Window* const told = find(window.id.number);
    if (told == nullptr) {
      window.isFullScreen = window.isShown = false;
      continue;
    }
    const bool isActive = window.isActive;
    window = *told;
    window.id.backend = &kBackend;
    window.isActive = isActive;
  }
}

bool sendKey(std::uint64_t window, std::uint32_t keysym, bool down, Modifiers modifiers) {
  open();
  const Window* const told = find(window);
  // Whoever has come to the front meanwhile must not get it; a release is owed whoever is there.
  if (down && (told == nullptr || !told->isActive)) return false;
  return tapKey(keysym, down, modifiers);
}

}  // namespace

const Backend kBackend{
    .open = open,
    .close =
        [] {
          dropKeyboard();
          forgetShell();
        },
    .takeIn = takeIn,
    .list = []() -> const std::vector<Window>& { return sWindows; },
    .look = look,
    .knowsFront = [] { return shell() == Shell::Telling; },
    .reach = [] { return shell() == Shell::Telling ? Reach::FocusedWindow : Reach::Nobody; },
    .activate = activateTold,
    .sendKey = sendKey,
    .outputs = [] { return outputsTold(); },
};

}  // namespace linux::windows::gnome
