#include "platform/base/clock.h"

#include <poll.h>
#include <sys/timerfd.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <ctime>
#include <utility>

#include "platform/base/file_descriptor.h"

namespace base {
namespace {

timespec toTimespec(Nanoseconds time) {
  return {.tv_sec = time / kSecond, .tv_nsec = static_cast<long>(time % kSecond)};
}

void sleepOnBootTime(Nanoseconds duration) {
  const timespec until = toTimespec(bootTime() + std::max<Nanoseconds>(duration, 0));
  while (clock_nanosleep(CLOCK_BOOTTIME, TIMER_ABSTIME, &until, nullptr) == EINTR) {
  }
}

/// A descriptor that becomes readable at the deadline. A time-out of poll would not count the time that the
/// machine sleeps.
class Alarm {
 public:
  /// The descriptor, set for this deadline; borrowed.
  int setFor(Nanoseconds deadline) {
    // Kept between waits, as making and closing one costs a button some 20 µs. A forked child needs its own.
    if (owner_ != getpid()) {
      timer_ = FileDescriptor(timerfd_create(CLOCK_BOOTTIME, TFD_CLOEXEC | TFD_NONBLOCK));
      owner_ = getpid();
      deadline_.reset();
    }
    if (deadline != deadline_) {
      // A time of zero would disarm it.
      const itimerspec at{.it_interval = {}, .it_value = toTimespec(std::max<Nanoseconds>(deadline, 1))};
      timerfd_settime(timer_.get(), TFD_TIMER_ABSTIME, &at, nullptr);
      deadline_ = deadline;
    }
    return timer_.get();
  }

 private:
  FileDescriptor timer_;
  pid_t owner_ = 0;
  std::optional<Nanoseconds> deadline_;
};

TimeSource& current() {
  static TimeSource source{.now = bootTime, .wait = waitForSources, .sleep = sleepOnBootTime};
  return source;
}

}  // namespace

Nanoseconds bootTime() {
  timespec now{};
  clock_gettime(CLOCK_BOOTTIME, &now);
  return now.tv_sec * kSecond + now.tv_nsec;
}

void waitForSources(std::optional<Nanoseconds> deadline) {
  static Alarm alarm;
  std::array<pollfd, 2> watched{};
  watched[0] = {.fd = runLoopDescriptor(), .events = POLLIN, .revents = 0};
  watched[1] = {.fd = deadline ? alarm.setFor(*deadline) : -1, .events = POLLIN, .revents = 0};
  // An interruption only makes the loop look again.
  poll(watched.data(), watched.size(), -1);
}

const TimeSource& timeSource() { return current(); }

void setTimeSource(TimeSource source) {
  if (!source.now) source.now = bootTime;
  if (!source.wait) source.wait = waitForSources;
  if (!source.sleep) source.sleep = sleepOnBootTime;
  current() = std::move(source);
}

}  // namespace base

double HostAbsoluteTime() {
  return static_cast<double>(base::timeSource().now()) / static_cast<double>(base::kSecond);
}

void HostSleepMicroseconds(std::uint32_t microseconds) {
  base::timeSource().sleep(base::Nanoseconds{microseconds} * 1000);
}
