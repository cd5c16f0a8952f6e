// The sources on the loop.
#pragma once

#include "platform/base/run_loop.h"

namespace base {

/// The source to serve next, borrowed: of those with something to deliver the one of lowest order, and among
/// equals the one that was served longest ago. Null when none is ready. It counts as served.
Source* nextReadySource();

}  // namespace base
