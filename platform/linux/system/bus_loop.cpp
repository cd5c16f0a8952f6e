#include "platform/linux/system/bus_loop.h"

#include <cerrno>
#include <chrono>
#include <cstdint>
#include <utility>

#include "platform/host.h"
#include "platform/linux/system/turn.h"

namespace linux::system {

namespace {

/// On the clock that sd_bus_get_timeout counts on, in microseconds.
std::uint64_t monotonicTime() {
  using std::chrono::steady_clock;
  return static_cast<std::uint64_t>(
      std::chrono::duration_cast<std::chrono::microseconds>(steady_clock::now().time_since_epoch()).count());
}

}  // namespace

base::Owned<base::Source> putOnLoop(sd_bus* connection, std::function<void()> takeIn) {
  base::Owned<base::Source> source(new base::Source(sd_bus_get_fd(connection), 0, std::move(takeIn)));
  // What sd-bus has read while it waited for an answer no longer shows on the descriptor.
  source->prepare = [connection] {
    std::uint64_t timeout = 0;
    return sd_bus_get_timeout(connection, &timeout) >= 0 && timeout <= monotonicTime();
  };
  HostRunLoopAddSource(HostRunLoopCurrent(), HostSourceRef(source.get()), HostRunLoopMode::Default);
  return source;
}

void takeOffLoop(base::Owned<base::Source>& source) {
  if (source == nullptr) return;
  HostRunLoopRemoveSource(HostRunLoopCurrent(), HostSourceRef(source.get()), HostRunLoopMode::Default);
  source.reset();
}

bool handleArrived(sd_bus* connection) {
  constexpr int kMostMessages = 256;
  int done = 1;
  for (int i = 0; done > 0 && i < kMostMessages; ++i) done = sd_bus_process(connection, nullptr);
  // Busy means that this was called from a handler of a message, which the caller up there goes on with.
  return done >= 0 || done == -EBUSY;
}

bool waitForArrival(sd_bus* connection, const base::Deadline& deadline) {
  // sd_bus_wait does not count what has been read already.
  std::uint64_t queued = 0;
  if (sd_bus_get_n_queued_read(connection, &queued) >= 0 && queued > 0) return true;
  const auto left = std::chrono::ceil<Limit>(deadline.left());
  return sd_bus_wait(connection, static_cast<std::uint64_t>(left.count())) > 0;
}

}  // namespace linux::system
