#include "receiver/clock.h"

#include <ctime>

namespace receiver {

Time now() {
  timespec time{};
  clock_gettime(CLOCK_BOOTTIME, &time);
  const auto all = std::chrono::seconds(time.tv_sec) + std::chrono::nanoseconds(time.tv_nsec);
  return std::chrono::duration_cast<Time>(all);
}

}  // namespace receiver
