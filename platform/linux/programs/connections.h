// Programs that the session bus tells of by itself: they have the objects of their windows there, as GTK's
// and KDE's do, whether or not a window system knows these windows.
//
// A program is known by its executable or by its own name on the bus. It counts from when it has its first
// window: one that serves in the background has none.
#pragma once

#include <string>
#include <vector>

#include "platform/linux/programs/table.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/windows/window.h"

namespace linux::programs {

/// A program's connection to the bus.
struct Connection {
  /// One that has windows there.
  const Program* program = nullptr;
  /// By its unique name.
  system::Callee callee;
};

/// Takes in what the bus has sent. True when the list has changed since the last call. Asks the bus once for
/// each newcomer, and a program that has no window yet once a turn.
bool takeInConnections();

/// In no particular order. Valid until takeInConnections.
const std::vector<Connection>& connections();

/// Where the actions of such a program's newest window are; empty for one that is not GTK's.
windows::GtkNames gtkNamesOf(const Program& program, const std::string& uniqueName);

}  // namespace linux::programs
