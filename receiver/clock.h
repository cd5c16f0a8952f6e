// The clock that events and timers are on.
#pragma once

#include <chrono>

namespace receiver {

/// A moment, or a span, on CLOCK_BOOTTIME, which goes on while the machine sleeps.
using Time = std::chrono::microseconds;

Time now();

}  // namespace receiver
