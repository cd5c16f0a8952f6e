#include "platform/linux/windows/gnome/gnome.h"

#include <algorithm>
#include <cstdlib>
#include <string>
#include <utility>

#include "platform/linux/windows/gnome/accessibility.h"
#include "platform/linux/windows/gnome/keyboard.h"
#include "platform/linux/windows/gnome/shell.h"

namespace linux::windows::gnome {

namespace {

/// As last taken in, and as known since.
std::vector<Window> sWindows;
std::vector<Window> sNow;

/// Under X11 the X server knows all that the shell does.
bool isOnWayland() { return std::getenv("WAYLAND_DISPLAY") != nullptr; }

std::vector<Window> windowsNow() {
  if (shell() == Shell::Telling) return windowsTold();
  return shell() == Shell::Silent ? windowsByAccessibility() : std::vector<Window>();
}

bool open() {
  const Shell there = isOnWayland() ? takeInShell() : Shell::None;
  if (there == Shell::Silent) {
    takeInAccessibility();
  } else {
    forgetAccessibility();
  }
  sNow = windowsNow();
  for (Window& window : sNow) window.id.backend = &kBackend;
  if (keysAreWanted() && there == Shell::Silent && !sNow.empty()) prepareKeyboard();
  return there != Shell::None;
}

std::string obstacle() {
  if (!isOnWayland()) return "WAYLAND_DISPLAY is not set";
  if (!open()) return "nobody has the name org.gnome.Shell on the session bus";
  if (shell() == Shell::Telling) return "";
  return "its extension kvd@tarn.com does not run: accessibility tells which program is in front, if it "
         "knows";
}

bool takeIn() {
  open();
  if (sWindows == sNow) return false;
  sWindows = sNow;
  return true;
}

const Window* find(std::uint64_t number) {
  const auto found = std::ranges::find(sNow, number, [](const Window& window) { return window.id.number; });
  return found != sNow.end() ? &*found : nullptr;
}

void look(std::span<Window> windows) {
  open();
  for (Window& window : windows) {
    const Window* const now = find(window.id.number);
    if (now == nullptr) {
      window.isFullScreen = window.isShown = false;
      continue;
    }
    const bool isActive = std::exchange(window, *now).isActive;
    window.isActive = isActive;
  }
}

/// Accessibility knows of some programs only: where it knows nobody the X server may, of those on XWayland.
bool knowsFront() {
  return shell() == Shell::Telling ||
         std::ranges::any_of(sNow, [](const Window& each) { return each.isActive; });
}

bool sendKey(std::uint64_t window, std::uint32_t keysym, bool down, Modifiers modifiers) {
  open();
  const Window* const now = find(window);
  // Whoever has come to the front meanwhile must not get it; a release is owed whoever is there.
  if (down && (now == nullptr || !now->isActive)) return false;
  return tapKey(keysym, down, modifiers);
}

void close() {
  dropKeyboard();
  forgetAccessibility();
  forgetShell();
}

}  // namespace

const Backend kBackend{
    .name = "GNOME Shell",
    .obstacle = obstacle,
    .open = open,
    .close = close,
    .takeIn = takeIn,
    .list = []() -> const std::vector<Window>& { return sWindows; },
    .look = look,
    .knowsFront = knowsFront,
    .reach = [] { return shell() != Shell::None ? Reach::FocusedWindow : Reach::Nobody; },
    .activate = activateTold,
    .sendKey = sendKey,
    .outputs = [] { return outputsTold(); },
};

}  // namespace linux::windows::gnome
