// Ports: a Mach port is a Unix datagram socket, one kernel queue for many senders with message boundaries
// kept.
#pragma once

#include <sys/types.h>

#include <cstddef>
#include <cstdint>
#include <functional>
#include <span>

#include "platform/base/object.h"
#include "platform/base/service_directory.h"
#include "platform/mach.h"

namespace base {

/// How many messages have been delivered to callbacks and how many were dropped before that.
struct PortCounts {
  std::uint64_t delivered = 0;
  std::uint64_t dropped = 0;
};
/// The port's counts since it was made; zeros for null.
PortCounts portCounts(HostPortRef port);

/// Told of every message that a callback is about to get, and which process sent it.
void setMessageObserver(std::function<void(std::span<const std::byte> message, pid_t sender)> observer);

}  // namespace base
