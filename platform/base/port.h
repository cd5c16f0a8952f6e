// Ports: a Mach port is a Unix datagram socket, one kernel queue for many senders with message boundaries
// kept.
#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "platform/base/object.h"
#include "platform/mach.h"

namespace base {

/// The directory of this user's service sockets: $XDG_RUNTIME_DIR; where unset /run/user/<uid> if there; else
/// a private directory under the temporary one, made with mode 0700 when `create`. Nothing when it cannot be
/// trusted.
std::optional<std::string> serviceDirectory(bool create);

/// How many messages have been delivered to callbacks and how many were dropped before that.
struct PortCounts {
  std::uint64_t delivered = 0;
  std::uint64_t dropped = 0;
};
PortCounts portCounts(HostPortRef port);

}  // namespace base
