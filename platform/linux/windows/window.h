// A window as kvd knows it, whatever window system it is of.
#pragma once

#include <sys/types.h>

#include <cstdint>
#include <string>

namespace linux::windows {

struct Backend;

/// What a back end knows a window by; only that back end understands the number. No window without one.
struct ID {
  const Backend* backend = nullptr;
  std::uint64_t number = 0;

  explicit operator bool() const { return backend != nullptr; }
  friend bool operator==(const ID&, const ID&) = default;
};

/// A rectangle in the pixels of the back end's outputs.
struct Area {
  int x = 0;
  int y = 0;
  int width = 0;
  int height = 0;
  friend bool operator==(const Area&, const Area&) = default;
};

/// Where on the session bus a GTK window's actions are; as the program wrote it, and empty for all others.
/// A window path that ends in '/' stands for the newest window below it.
struct GtkNames {
  std::string busName;
  std::string applicationPath;
  std::string windowPath;
  friend bool operator==(const GtkNames&, const GtkNames&) = default;
};

/// A window of some program. What a back end does not know is empty, 0 or false.
struct Window {
  ID id;
  // Who it is: as of the last takeIn.
  pid_t process = 0;
  /// What the program calls itself: the application id of Wayland and of GTK.
  std::string applicationID;
  /// Both parts of WM_CLASS on X11. A look brings the class up to date too: an office changes it with the
  /// document in the window.
  std::string instanceName;
  std::string className;
  /// It belongs to another window.
  bool isDialog = false;
  /// The person types into it.
  bool isActive = false;
  // How it looks: only what look() returns is up to date.
  std::string title;
  bool isFullScreen = false;
  /// Not hidden, minimized or on another desktop.
  bool isShown = false;
  Area area;
  GtkNames gtk;
  friend bool operator==(const Window&, const Window&) = default;
};

/// One active output.
struct Output {
  /// Stable while the output is connected, and never 0.
  std::uint32_t id = 0;
  Area area;
};

}  // namespace linux::windows
