#include "platform/linux/windows/wlr/wlr.h"

#include <algorithm>
#include <string>

#include "platform/linux/windows/wayland/connection.h"
#include "platform/linux/windows/wayland/keyboard.h"
#include "platform/linux/windows/wayland/outputs.h"
#include "platform/linux/windows/wayland/seat.h"
#include "platform/linux/windows/wayland/toplevel_windows.h"
#include "platform/linux/windows/wayland/toplevels.h"
#include "platform/linux/windows/wlr/foreign_toplevels.h"
#include "platform/linux/windows/wlr/processes.h"

namespace linux::windows::wlr {

namespace {

std::vector<Window> sWindows;
/// toplevelChanges() when they were read.
unsigned sChanges = 0;

constexpr wayland::Interest kInterests[] = {{"zwlr_foreign_toplevel_manager_v1", takeManager}};

extern const wayland::Part kPart;

void begin() {
  wayland::noteAllAreKnown();
  if (keysAreWanted() && wayland::speaks(kPart)) wayland::plugInKeyboard();
}

const wayland::Part kPart{.interests = kInterests, .isTold = hasManager, .begin = begin, .end = dropManager};

bool isConnected() { return wayland::connection() != nullptr && wayland::speaks(kPart); }

std::string obstacle() {
  if (isConnected())
    return wayland::reachesFront() ? "" : "it makes no keyboards (zwp_virtual_keyboard_manager_v1)";
  if (wayland::connection() == nullptr) return wayland::obstacle();
  return hasManager() ? "it is asked in another way" : "it does not offer zwlr_foreign_toplevel_manager_v1";
}

bool takeIn() {
  isConnected();
  if (sChanges == wayland::toplevelChanges()) return false;
  sChanges = wayland::toplevelChanges();
  const auto told = hasManager() ? wayland::toplevels() : std::vector<wayland::Toplevel*>();
  findProcesses(wayland::compositor(), told);
  sWindows.clear();
  for (const wayland::Toplevel* const toplevel : told) {
    sWindows.push_back(wayland::windowOf(*toplevel, kBackend));
  }
  return true;
}

void look(std::span<Window> windows) {
  wayland::connection();
  const std::vector<Container> containers = readContainers(wayland::compositor());
  for (Window& window : windows) {
    wayland::Toplevel* const toplevel = wayland::findToplevel(window.id.number);
    const auto container = std::ranges::find_if(containers, [&](const Container& each) {
      return toplevel != nullptr && each.id == toplevel->container;
    });
    if (container != containers.end()) toplevel->applicationID = container->applicationID;
    if (!wayland::lookAgain(window) || container == containers.end() || !window.isFullScreen) continue;
    // Sway tells of full screen on workspaces that are not shown too, and since 1.10 of no outputs.
    window.isShown = container->isVisible;
    if (const Area area = wayland::areaOf(container->output); area.width > 0) window.area = area;
  }
}

void bringToFront(std::uint64_t window) {
  wayland::connection();
  const wayland::Toplevel* const toplevel = wayland::findToplevel(window);
  if (toplevel == nullptr || wayland::seat() == nullptr) return;
  activate(*toplevel, wayland::seat());
  wayland::flush();
}

}  // namespace

const Backend kBackend{
    .name = "Wayland (wlr)",
    .obstacle = obstacle,
    .init = [] { wayland::join(kPart); },
    .open = isConnected,
    .close = wayland::disconnect,
    .takeIn = takeIn,
    .list = []() -> const std::vector<Window>& { return sWindows; },
    .look = look,
    .knowsFront = isConnected,
    .reach = [] { return isConnected() && wayland::reachesFront() ? Reach::FocusedWindow : Reach::Nobody; },
    .activate = bringToFront,
    .sendKey = wayland::sendKey,
    .outputs = [] { return isConnected() ? wayland::outputs() : std::vector<Output>(); },
};

}  // namespace linux::windows::wlr
