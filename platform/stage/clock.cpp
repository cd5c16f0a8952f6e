#include "platform/stage/clock.h"

#include <poll.h>
#include <sys/signalfd.h>

#include <algorithm>
#include <csignal>
#include <ctime>
#include <utility>

#include "platform/base/clock.h"
#include "platform/base/signal_set.h"

namespace stage {

namespace {

bool sVirtual = false;
Nanoseconds sNow = kVirtualStart;

std::function<bool()> sSleepListener;
/// So long a sleep asks nobody.
constexpr Nanoseconds kSlice = kSecond / 4;
Slept sSlept;

/// A descriptor that polls as readable while one of these signals is pending, being blocked. Nobody reads it:
/// the run loop and the terminal take signals from descriptors of their own.
int pendingSignals() {
  static const int descriptor = [] {
    const sigset_t awaited = base::signalSet({SIGTERM, SIGINT, SIGHUP, SIGQUIT, SIGTSTP, SIGWINCH});
    return signalfd(-1, &awaited, SFD_CLOEXEC | SFD_NONBLOCK);
  }();
  return descriptor;
}

bool askedToEnd() {
  sigset_t pending;
  if (sigpending(&pending) != 0) return false;
  for (const int signal : {SIGTERM, SIGINT, SIGHUP, SIGQUIT}) {
    if (sigismember(&pending, signal) == 1) return true;
  }
  return false;
}

void sleepInRealTime(Nanoseconds duration) {
  const Nanoseconds end = now() + duration;
  for (Nanoseconds left = duration; left > 0; left = end - now()) {
    if (sSleepListener && !sSleepListener()) return;
    if (askedToEnd()) return;
    const Nanoseconds slice = std::min(left, kSlice);
    const timespec time{slice / kSecond, slice % kSecond};
    pollfd signals{pendingSignals(), POLLIN, 0};
    ppoll(&signals, 1, &time, nullptr);
  }
}

}  // namespace

void useVirtualTime() { sVirtual = true; }

bool timeIsVirtual() { return sVirtual; }

Nanoseconds now() { return sVirtual ? sNow : base::bootTime(); }

std::optional<Nanoseconds> earlier(std::optional<Nanoseconds> a, std::optional<Nanoseconds> b) {
  if (!a || !b) return a ? a : b;
  return std::min(*a, *b);
}

void advanceTo(Nanoseconds time) { sNow = std::max(sNow, time); }

void pass(Nanoseconds duration) {
  if (sVirtual) return advanceTo(sNow + duration);
  const Nanoseconds begin = now();
  sleepInRealTime(duration);
  sSlept.asked += duration;
  sSlept.taken += now() - begin;
}

void setSleepListener(std::function<bool()> listener) { sSleepListener = std::move(listener); }

Slept slept() { return sSlept; }

}  // namespace stage
