#include "platform/base/deadline.h"

#include <poll.h>

#include <algorithm>
#include <cerrno>
#include <cstdint>
#include <limits>

#include "platform/base/clock.h"

namespace base {

Clock::time_point Clock::now() { return time_point(duration(timeSource().now())); }

std::chrono::nanoseconds Deadline::left() const {
  return std::max(end_ - Clock::now(), std::chrono::nanoseconds::zero());
}

int Deadline::milliseconds() const {
  const auto count = std::chrono::ceil<std::chrono::milliseconds>(left()).count();
  return static_cast<int>(std::min<std::int64_t>(count, std::numeric_limits<int>::max()));
}

bool waitFor(int descriptor, short events, const Deadline& deadline) {
  while (!deadline.hasPassed()) {
    pollfd watched{.fd = descriptor, .events = events, .revents = 0};
    const int ready = poll(&watched, 1, deadline.milliseconds());
    if (ready >= 0 || errno != EINTR) return ready > 0;
  }
  return false;
}

}  // namespace base
