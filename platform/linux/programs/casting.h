// Who plays which role: what a program tells of itself against the person's wish, the table of well-known
// programs, and the categories of its desktop entry, in this order.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include "platform/linux/programs/table.h"
#include "platform/linux/windows/window.h"

namespace linux::programs {

/// What a casting rests on.
enum class Ground : std::uint8_t {
  Unknown,       ///< neither its entry nor the table says anything
  Bystander,     ///< a proxy for other players or a headset; a browser's window
  OwnWord,       ///< X-Kvd-Application in its entry
  BusName,       ///< the table, by its bus name
  DesktopEntry,  ///< the table, by its desktop entry
  WindowClass,   ///< the table, by the class of its window
  Categories,    ///< those of its entry
  BusWindows,    ///< the table, by the windows that it has on the bus
};

struct Casting {
  Role role = Role::None;
  Ground ground = Ground::Unknown;
  /// Null for a program that is not in the table.
  const Program* program = nullptr;
  /// The person or packager has written the role into the desktop entry.
  bool byEntry = false;
  /// It takes the remote itself.
  bool takesRemote = false;
  /// The desktop entry without ".desktop"; empty where none was found.
  std::string entry;
};

/// The role of a player on the bus, by the entry that it names and its bus name after the common prefix.
Casting castPlayer(std::string_view desktopEntry, std::string_view busName);

/// The role of a window, by its application id and both parts of its class. A browser's window alone has
/// none.
Casting castWindow(const windows::Window& window);

}  // namespace linux::programs
