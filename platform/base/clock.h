// The time that the loop goes by.
#pragma once

#include "platform/base/run_loop.h"

namespace base {

/// CLOCK_BOOTTIME, whatever time source is in force.
Nanoseconds bootTime();

/// The time source in force; every member is set.
const TimeSource& timeSource();

}  // namespace base
