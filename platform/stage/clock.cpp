#include "platform/stage/clock.h"

#include <time.h>

#include <algorithm>
#include <cerrno>

namespace stage {

namespace {

bool sVirtual = false;
Nanoseconds sNow = kVirtualStart;

}  // namespace

void useVirtualTime() { sVirtual = true; }

bool timeIsVirtual() { return sVirtual; }

Nanoseconds now() {
  if (sVirtual) return sNow;
  timespec time{};
  clock_gettime(CLOCK_BOOTTIME, &time);
  return time.tv_sec * kSecond + time.tv_nsec;
}

void advanceTo(Nanoseconds time) { sNow = std::max(sNow, time); }

void pass(Nanoseconds duration) {
  if (sVirtual) return advanceTo(sNow + duration);
  timespec left{duration / kSecond, duration % kSecond};
  while (nanosleep(&left, &left) == -1 && errno == EINTR) {
  }
}

}  // namespace stage
