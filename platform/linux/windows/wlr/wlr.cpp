#include "platform/linux/windows/wlr/wlr.h"

#include "foreign_toplevel.h"
#include "platform/linux/windows/wlr/connection.h"
#include "platform/linux/windows/wlr/keyboard.h"
#include "platform/linux/windows/wlr/outputs.h"
#include "platform/linux/windows/wlr/processes.h"
#include "platform/linux/windows/wlr/toplevels.h"

namespace linux::windows::wlr {

namespace {

std::vector<Window> sWindows;
/// toplevelChanges() when they were read.
unsigned sChanges = 0;

Window windowOf(const Toplevel& toplevel) {
  const Description& told = toplevel.description;
  Window window;
  window.id = {&kBackend, toplevel.number};
  window.process = toplevel.process;
  // It stands for the class too: programs have the same text there, and change it as they change their class.
  window.applicationID = window.className = told.applicationID;
  window.isDialog = told.isDialog;
  window.isActive = told.isActive;
  window.title = told.title;
  window.isFullScreen = told.isFullScreen && !told.isMinimized;
  window.isShown = !told.isMinimized;
  window.area = areaOf(told.outputs);
  return window;
}

bool isConnected() { return connection() != nullptr; }

bool takeIn() {
  connection();
  if (sChanges == toplevelChanges()) return false;
  sChanges = toplevelChanges();
  const auto told = toplevels();
  findProcesses(compositor(), told);
  sWindows.clear();
  for (const Toplevel* const toplevel : told) sWindows.push_back(windowOf(*toplevel));
  return true;
}

void look(std::span<Window> windows) {
  connection();
  for (Window& window : windows) {
    const Toplevel* const toplevel = findToplevel(window.id.number);
    if (toplevel == nullptr) {
      window.isFullScreen = window.isShown = false;
      continue;
    }
    const bool isActive = window.isActive;
    window = windowOf(*toplevel);
    window.isActive = isActive;
    // Sway tells of full screen on workspaces that are not shown too, and since 1.10 of no outputs.
    const auto container = window.isFullScreen ? lookAt(compositor(), *toplevel) : std::nullopt;
    if (!container) continue;
    window.isShown = container->isVisible;
    if (const Area area = areaOf(container->output); area.width > 0) window.area = area;
  }
}

void activate(std::uint64_t window) {
  connection();
  const Toplevel* const toplevel = findToplevel(window);
  if (toplevel == nullptr || seat() == nullptr) return;
  zwlr_foreign_toplevel_handle_v1_activate(toplevel->handle, seat());
  flush();
}

bool sendKey(std::uint64_t window, std::uint32_t keysym, bool down, Modifiers modifiers) {
  connection();
  const Toplevel* const toplevel = findToplevel(window);
  // Whoever has come to the front meanwhile must not get it; a release is owed whoever is there.
  if (down && (toplevel == nullptr || !toplevel->description.isActive)) return false;
  return tapKey(keysym, down, modifiers) && flush();
}

}  // namespace

const Backend kBackend{
    .open = isConnected,
    .close = disconnect,
    .takeIn = takeIn,
    .list = []() -> const std::vector<Window>& { return sWindows; },
    .look = look,
    .knowsFront = [] { return isConnected() && followsToplevels(); },
    .reach = [] { return isConnected() && hasKeyboard() ? Reach::FocusedWindow : Reach::Nobody; },
    .activate = activate,
    .sendKey = sendKey,
    .outputs = [] { return isConnected() && followsToplevels() ? outputs() : std::vector<Output>(); },
};

}  // namespace linux::windows::wlr
