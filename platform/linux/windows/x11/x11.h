// The X server: windows, who is in front, outputs, keys for one window (Extended Window Manager Hints 1.5).
//
// The connection is made when it is first needed and made again, at most once a turn of the run loop, after
// it was lost. Without an X server every question answers with nothing.
#pragma once

#include <sys/types.h>

#include <cstdint>
#include <string>
#include <vector>

namespace desktop {

/// An X window; 0 is none.
using Window = std::uint32_t;

/// A managed window.
struct Client {
  Window window = 0;
  /// The process as the X server knows it (X-Resource), else as the window says; 0 where neither tells.
  pid_t process = 0;
  /// Both parts of WM_CLASS.
  std::string instanceName;
  std::string className;
  /// _GTK_APPLICATION_ID; empty where the program has none.
  std::string applicationID;
  /// It belongs to another window (WM_TRANSIENT_FOR).
  bool isDialog = false;
};

/// Whether there is an X server.
bool hasXServer();

/// Takes in what the X server has sent. True when windows came or went, or changed their order or whose they
/// are, since the last call.
bool takeInX();

/// The managed windows, topmost first.
const std::vector<Client>& clients();

/// _NET_ACTIVE_WINDOW.
Window activeWindow();

/// Shown, and _NET_WM_STATE_FULLSCREEN.
bool isFullScreen(Window window);

/// One active output, in pixels of the root window. Ids are stable while the output is connected and never 0.
struct Output {
  std::uint32_t id = 0;
  int x = 0;
  int y = 0;
  int width = 0;
  int height = 0;
};
std::vector<Output> outputs();

/// Whether a shown full-screen window covers most of this output.
bool isCaptured(std::uint32_t output);

/// Asks the window manager to activate the window.
void activate(Window window);

/// A text property of a window; empty when it has none.
std::string textProperty(Window window, const char* name);

/// Modifiers held while a key goes down or up.
enum Modifier : std::uint16_t { kNoModifier = 0, kShift = 1, kControl = 4, kAlt = 8 };

/// Sends a press or release of a key to one window and to nothing else, in the way that the most toolkits
/// accept. False when the keyboard has no such key or the window is gone.
bool sendKey(Window window, std::uint32_t keysym, bool down, std::uint16_t modifiers);

}  // namespace desktop
