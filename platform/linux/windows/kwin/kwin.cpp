#include "platform/linux/windows/kwin/kwin.h"

#include <algorithm>
#include <string>

#include "platform/linux/windows/kwin/desktops.h"
#include "platform/linux/windows/kwin/fake_keyboard.h"
#include "platform/linux/windows/kwin/plasma_windows.h"
#include "platform/linux/windows/kwin/reports.h"
#include "platform/linux/windows/wayland/connection.h"
#include "platform/linux/windows/wayland/outputs.h"

namespace linux::windows::kwin {

namespace {

std::vector<Window> sWindows;
/// Who told of them, and its changes() at that time.
const Source* sSource = nullptr;
unsigned sChanges = 0;

/// Something that only KWin offers, to whoever asks.
bool sIsKWin = false;

constexpr wayland::Interest kInterests[] = {
    {"org_kde_plasma_window_management", takeManager},
    {"org_kde_plasma_virtual_desktop_management", takeDesktops},
    {"org_kde_kwin_fake_input", takeFakeInput},
    {"org_kde_plasma_shell", [](const wayland::Offer&) { sIsKWin = true; }},
};

const wayland::Part kPart{
    .interests = kInterests,
    .isTold = hasManager,
    .begin =
        [] {
          if (keysAreWanted()) prepareKeyboard();
        },
    .end =
        [] {
          dropManager();
          dropDesktops();
          dropFakeInput();
          closeReports();
          sIsKWin = false;
        },
};

/// The connection's own word where a desktop entry lets kvd ask, else a script's; null beside other
/// compositors.
const Source* source() {
  if (wayland::connection() == nullptr) return nullptr;
  if (wayland::speaks(kPart)) return &kPlasma;
  return sIsKWin && wayland::nobodySpeaks() && openReports() ? &kReports : nullptr;
}

bool isOpen() { return source() != nullptr; }

std::string obstacle() {
  const Source* const by = source();
  if (wayland::connection() == nullptr) return wayland::obstacle();
  if (!sIsKWin) return "it is not KWin";
  if (by == nullptr) return "no desktop entry lets this program ask, and it runs no scripts";
  if (by == &kReports)
    return "no desktop entry lets this program ask: a script tells of windows, and keys reach none";
  return hasKeyboard() ? "" : "it takes no keys (org_kde_kwin_fake_input)";
}

std::vector<Window> told(const Source& by) {
  std::vector<Window> windows = by.windows();
  for (Window& window : windows) window.id.backend = &kBackend;
  return windows;
}

bool takeIn() {
  const Source* const now = source();
  const unsigned changes = now != nullptr ? now->changes() : 0;
  if (now == sSource && changes == sChanges) return false;
  sSource = now;
  sChanges = changes;
  sWindows = now != nullptr ? told(*now) : std::vector<Window>();
  return true;
}

void look(std::span<Window> windows) {
  const Source* const by = source();
  const std::vector<Window> now = by != nullptr ? told(*by) : std::vector<Window>();
  for (Window& window : windows) {
    const auto found = std::ranges::find(now, window.id, &Window::id);
    const bool isActive = window.isActive;
    if (found != now.end()) {
      window = *found;
      window.isActive = isActive;
    } else {
      window.isFullScreen = window.isShown = false;
    }
  }
}

void activate(std::uint64_t window) {
  if (const Source* const by = source()) by->activate(window);
}

bool isActive(std::uint64_t number) {
  const Source* const by = source();
  return by != nullptr && std::ranges::any_of(by->windows(), [&](const Window& each) {
           return each.isActive && each.id.number == number;
         });
}

bool sendKey(std::uint64_t window, std::uint32_t keysym, bool down, Modifiers modifiers) {
  // Whoever has come to the front meanwhile must not get it; a release is owed whoever is there.
  if (down && !isActive(window)) return false;
  return tapKey(keysym, down, modifiers) && wayland::flush();
}

}  // namespace

const Backend kBackend{
    .name = "KWin",
    .obstacle = obstacle,
    .init = [] { wayland::join(kPart); },
    .open = isOpen,
    .close = wayland::disconnect,
    .takeIn = takeIn,
    .list = []() -> const std::vector<Window>& { return sWindows; },
    .look = look,
    .knowsFront = isOpen,
    .reach = [] { return isOpen() && hasKeyboard() ? Reach::FocusedWindow : Reach::Nobody; },
    .activate = activate,
    .sendKey = sendKey,
    .outputs = [] { return isOpen() ? wayland::outputs() : std::vector<Output>(); },
};

}  // namespace linux::windows::kwin
