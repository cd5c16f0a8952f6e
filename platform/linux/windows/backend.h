// What a window system has to offer: a table of functions that each back end fills in.
#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <vector>

#include "platform/linux/windows/window.h"

namespace linux::windows {

/// How far a key can be sent.
enum class Reach : std::uint8_t {
  Nobody,
  FocusedWindow,
  AnyWindow,
};

/// Modifiers held while a key goes down or up.
enum Modifier : std::uint8_t { kNoModifier = 0, kShift = 1, kControl = 2, kAlt = 4 };
using Modifiers = std::uint8_t;

/// A back end. None of its functions waits longer than a question may take; a window that has gone is as good
/// as one that does nothing. What a back end lacks it takes from kNone (none.h).
struct Backend {
  /// What it asks, for people.
  const char* name = "";
  /// Why it is not open, or what it cannot tell, in a few words; empty where nothing is missing.
  std::string (*obstacle)() = [] { return std::string(); };
  /// Called before all others; null where nothing is to be prepared.
  void (*init)() = nullptr;
  /// Makes the connection, where there is none, at most once a turn of the run loop. Whether there is one.
  bool (*open)() = nullptr;
  /// Closes the connection for good.
  void (*close)() = nullptr;
  /// Opens it and takes in what the window system has sent. True when the list has changed since the last
  /// call.
  bool (*takeIn)() = nullptr;
  /// The windows that the person has open, topmost first. Valid until takeIn.
  const std::vector<Window>& (*list)() = nullptr;
  /// Brings up to date how windows of list() look, and their class.
  void (*look)(std::span<Window> windows) = nullptr;
  /// Whether it can tell which window is active.
  bool (*knowsFront)() = nullptr;
  /// The same for who only looks as for who types.
  Reach (*reach)() = nullptr;
  /// Asks for the window to come to the front.
  void (*activate)(std::uint64_t window) = nullptr;
  /// Sends a press or release of a key, an X keysym (which is what xkb names them), to a window within reach.
  /// False when the keyboard has no such key or the window is gone.
  bool (*sendKey)(std::uint64_t window, std::uint32_t keysym, bool down, Modifiers modifiers) = nullptr;
  /// In the pixels in which it tells the areas of windows.
  std::vector<Output> (*outputs)() = nullptr;
};

/// Whether keys will be sent. A back end gets ready for them with the connection, as the first must not be
/// late.
bool keysAreWanted();

}  // namespace linux::windows
