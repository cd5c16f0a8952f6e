#include "platform/linux/windows/cosmic/cosmic.h"

#include <string>

#include "platform/linux/windows/cosmic/toplevel_info.h"
#include "platform/linux/windows/wayland/connection.h"
#include "platform/linux/windows/wayland/keyboard.h"
#include "platform/linux/windows/wayland/outputs.h"
#include "platform/linux/windows/wayland/toplevel_windows.h"

namespace linux::windows::cosmic {

namespace {

std::vector<Window> sWindows;
/// toplevelChanges() when they were read.
unsigned sChanges = 0;

constexpr wayland::Interest kInterests[] = {
    {"ext_foreign_toplevel_list_v1", noteList},
    {"zcosmic_toplevel_info_v1", noteInfo},
};

void begin() {
  // Others tell more.
  if (!wayland::nobodySpeaks()) return;
  beginInfo();
  if (keysAreWanted() && hasInfo()) wayland::plugInKeyboard();
}

const wayland::Part kPart{.interests = kInterests, .isTold = hasInfo, .begin = begin, .end = endInfo};

bool isConnected() { return wayland::connection() != nullptr && wayland::speaks(kPart); }

std::string obstacle() {
  if (isConnected())
    return wayland::reachesFront() ? "" : "it makes no keyboards (zwp_virtual_keyboard_manager_v1)";
  if (wayland::connection() == nullptr) return wayland::obstacle();
  return hasInfo() ? "it is asked in another way" : "it does not offer zcosmic_toplevel_info_v1";
}

bool takeIn() {
  const bool isTold = isConnected();
  if (sChanges == wayland::toplevelChanges()) return false;
  sChanges = wayland::toplevelChanges();
  sWindows.clear();
  if (!isTold) return true;
  for (const wayland::Toplevel* const toplevel : wayland::toplevels()) {
    sWindows.push_back(wayland::windowOf(*toplevel, kBackend));
  }
  return true;
}

void look(std::span<Window> windows) {
  wayland::connection();
  for (Window& window : windows) wayland::lookAgain(window);
}

}  // namespace

const Backend kBackend{
    .name = "COSMIC",
    .obstacle = obstacle,
    .init = [] { wayland::join(kPart); },
    .open = isConnected,
    .close = wayland::disconnect,
    .takeIn = takeIn,
    .list = []() -> const std::vector<Window>& { return sWindows; },
    .look = look,
    .knowsFront = isConnected,
    .reach = [] { return isConnected() && wayland::reachesFront() ? Reach::FocusedWindow : Reach::Nobody; },
    .activate = [](std::uint64_t) {},
    .sendKey = wayland::sendKey,
    .outputs = [] { return isConnected() ? wayland::outputs() : std::vector<Output>(); },
};

}  // namespace linux::windows::cosmic
