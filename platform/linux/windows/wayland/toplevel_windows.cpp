#include "platform/linux/windows/wayland/toplevel_windows.h"

#include "platform/linux/windows/wayland/connection.h"
#include "platform/linux/windows/wayland/keyboard.h"
#include "platform/linux/windows/wayland/outputs.h"

namespace linux::windows::wayland {

Window windowOf(const Toplevel& toplevel, const Backend& backend) {
  const Description& told = toplevel.description;
  Window window;
  window.id = {&backend, toplevel.number};
  window.process = toplevel.process;
  // It stands for the class too: programs have the same text there, and change it as they change their class.
  window.applicationID = window.className =
      toplevel.applicationID.empty() ? told.applicationID : toplevel.applicationID;
  window.isDialog = told.isDialog;
  window.isActive = told.isActive;
  window.title = told.title;
  window.isFullScreen = told.isFullScreen && !told.isMinimized;
  window.isShown = !told.isMinimized;
  window.area = areaOf(told.outputs);
  return window;
}

bool lookAgain(Window& window) {
  const Toplevel* const toplevel = findToplevel(window.id.number);
  if (toplevel == nullptr) {
    window.isFullScreen = window.isShown = false;
    return false;
  }
  const bool isActive = window.isActive;
  window = windowOf(*toplevel, *window.id.backend);
  window.isActive = isActive;
  return true;
}

bool sendKey(std::uint64_t window, std::uint32_t keysym, bool down, Modifiers modifiers) {
  connection();
  const Toplevel* const toplevel = findToplevel(window);
  if (down && (toplevel == nullptr || !toplevel->description.isActive)) return false;
  return tapKey(keysym, down, modifiers) && flush();
}

}  // namespace linux::windows::wayland
