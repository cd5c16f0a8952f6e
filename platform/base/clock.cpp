#include "platform/base/clock.h"

#include <poll.h>
#include <sys/timerfd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <ctime>
#include <utility>

#include "platform/base/sockets.h"

namespace base {
namespace {

constexpr Nanoseconds kSecond = 1'000'000'000;

timespec toTimespec(Nanoseconds time) {
  return {.tv_sec = time / kSecond, .tv_nsec = static_cast<long>(time % kSecond)};
}

Nanoseconds bootTime() {
  timespec now{};
  clock_gettime(CLOCK_BOOTTIME, &now);
  return now.tv_sec * kSecond + now.tv_nsec;
}

void sleepOnBootTime(Nanoseconds duration) {
  const timespec until = toTimespec(bootTime() + std::max<Nanoseconds>(duration, 0));
  while (clock_nanosleep(CLOCK_BOOTTIME, TIMER_ABSTIME, &until, nullptr) == EINTR) {
  }
}

/// A timer descriptor that becomes readable at the deadline. A time-out of poll would not count the time that
/// the machine sleeps. Made for one wait: a timer that is kept would be shared with forked children.
FileDescriptor armedTimer(Nanoseconds deadline) {
  FileDescriptor timer(timerfd_create(CLOCK_BOOTTIME, TFD_CLOEXEC | TFD_NONBLOCK));
  // A time of zero would disarm it.
  const itimerspec at{.it_interval = {}, .it_value = toTimespec(std::max<Nanoseconds>(deadline, 1))};
  timerfd_settime(timer.get(), TFD_TIMER_ABSTIME, &at, nullptr);
  return timer;
}

TimeSource& current() {
  static TimeSource source{.now = bootTime, .wait = waitForSources, .sleep = sleepOnBootTime};
  return source;
}

}  // namespace

void waitForSources(std::optional<Nanoseconds> deadline) {
  const FileDescriptor timer = deadline ? armedTimer(*deadline) : FileDescriptor();
  std::array<pollfd, 2> watched{};
  watched[0] = {.fd = runLoopDescriptor(), .events = POLLIN, .revents = 0};
  watched[1] = {.fd = timer.get(), .events = POLLIN, .revents = 0};
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
