#include "platform/linux/windows/keystrokes.h"

#include <algorithm>

namespace desktop {

Window keyboardWindow(const Instance& instance) {
  const auto isOurs = [&](Window window) {
    return std::find(instance.windows.begin(), instance.windows.end(), window) != instance.windows.end();
  };
  if (isOurs(activeWindow())) return activeWindow();
  const auto full = std::find_if(instance.windows.begin(), instance.windows.end(), isFullScreen);
  if (full != instance.windows.end()) return *full;
  return instance.windows.empty() ? 0 : instance.windows.front();
}

bool type(const Instance& instance, std::string_view keys) {
  const Window window = keyboardWindow(instance);
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

}  // namespace desktop
