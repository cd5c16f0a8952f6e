// How long something may take.
#pragma once

#include <chrono>

#include "platform/base/run_loop.h"

namespace base {

/// The run loop's time as a clock of the standard library: it goes on while the machine sleeps, and stands
/// where a test has put it.
struct Clock {
  using duration = std::chrono::nanoseconds;
  using rep = duration::rep;
  using period = duration::period;
  using time_point = std::chrono::time_point<Clock>;
  static constexpr bool is_steady = true;

  static time_point now();
};

/// A moment that comes so long from now.
class Deadline {
 public:
  explicit Deadline(std::chrono::nanoseconds limit) : end_(Clock::now() + limit) {}

  bool hasPassed() const { return Clock::now() >= end_; }
  /// The time until then, never negative.
  std::chrono::nanoseconds left() const;
  /// The same in milliseconds for poll(), rounded up: a wait that is too short would be a spin.
  int milliseconds() const;

 private:
  Clock::time_point end_;
};

/// Waits until the descriptor has one of these events of poll(), or an error to tell. False when the time was
/// up: the deadline has passed, or poll() has waited that long, even if the clock stands.
bool waitFor(int descriptor, short events, const Deadline& deadline);

}  // namespace base
