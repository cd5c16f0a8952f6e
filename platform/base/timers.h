// The timers on the loop.
#pragma once

#include <optional>
#include <vector>

#include "platform/base/run_loop.h"

namespace base {

/// The timers that are due, in due order, those of one moment in the order of their creation.
std::vector<Owned<Timer>> dueTimers(Nanoseconds now);

/// When the earliest timer is due.
std::optional<Nanoseconds> earliestDue();

/// Calls a timer that is due, its next firing fixed before.
void fire(Timer& timer);

}  // namespace base
