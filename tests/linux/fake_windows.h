// A window system that a test makes up: a back end that tells of a screen, and writes down what reaches
// windows.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "platform/linux/windows/backend.h"

namespace fake {

/// What there is to be seen; a test changes it as it likes. Windows are called by their titles.
struct Screen {
  bool knowsFront = true;
  linux::windows::Reach reach = linux::windows::Reach::AnyWindow;
  std::vector<linux::windows::Output> outputs{{1, {0, 0, 1280, 720}}};
  /// Topmost first.
  std::vector<linux::windows::Window> windows;
  /// Set when windows come, go, or another one is active.
  bool changed = false;
  /// Whether the present call of the window system fails: it shows nothing or does nothing.
  std::function<bool()> callFails = [] { return false; };
  /// Told of what reaches a window: "window Talk: key F5 down".
  std::function<void(const std::string& text)> journal;
};
Screen& screen();

extern const linux::windows::Backend kWindows;

/// Opens a window on top of the others: of a process, its GTK actions where this name on the bus has them.
linux::windows::Window& openWindow(const std::string& title, pid_t process, const std::string& busName);
/// Throws remote::UsageError when there is no such window.
linux::windows::Window& window(const std::string& title);

}  // namespace fake
