// The names under which this process knows its ports.
//
// A service has one name, whether it was looked up or checked in, and behind the name stands the socket that
// sends to it.
#pragma once

#include <string_view>

#include "platform/base/file_descriptor.h"
#include "platform/mach.h"

namespace base {

inline constexpr mach_port_t kTaskPort = 1;
inline constexpr mach_port_t kBootstrapPort = 2;

/// The name of a service's port, made when it is asked for the first time.
mach_port_t portName(std::string_view service);

/// Puts a connected socket behind a name that portName gave; the one that was there is closed.
void setSendSocket(mach_port_t name, FileDescriptor socket);

/// The socket that sends to the port, borrowed; -1 when this process has none.
int sendSocket(mach_port_t name);

/// Reads what waits in the kernel's queue into memory where this process is the port's receiver, so that it
/// cannot wait for itself; true when there was something. Set by the receiving side; null in a program that
/// only sends.
using MakeRoom = bool (*)(mach_port_t name);
extern MakeRoom makeRoom;

/// Whether there is a bootstrap server to ask for; set by a host on whose desktop it can be missing.
using BootstrapTest = bool (*)();
extern BootstrapTest bootstrapIsThere;

}  // namespace base
