#include "platform/linux/windows/keystrokes.h"

#include <algorithm>

#include "platform/linux/windows/keysyms.h"
#include "platform/linux/windows/windows.h"

namespace linux::windows {

const Window* keyboardWindow(std::span<const Window> windows) {
  const auto active = std::ranges::find_if(windows, &Window::isActive);
  if (active != windows.end()) return &*active;
  const auto full =
      std::ranges::find_if(windows, [](const Window& each) { return each.isFullScreen && each.isShown; });
  if (full != windows.end()) return &*full;
  return windows.empty() ? nullptr : &windows.front();
}

bool type(ID window, std::string_view keys) {
  bool first = true;
  while (!keys.empty()) {
    const std::size_t end = keys.find(' ');
    const auto stroke = parseKey(keys.substr(0, end));
    keys.remove_prefix(end == std::string_view::npos ? keys.size() : end + 1);
    const bool pressed = stroke && sendKey(window, stroke->keysym, true, stroke->modifiers);
    if (first && !pressed) return false;
    first = false;
    // The press may have closed the window: then nobody misses the release.
    if (pressed) sendKey(window, stroke->keysym, false, stroke->modifiers);
  }
  return !first;
}

}  // namespace linux::windows
