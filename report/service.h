// The socket to which buttons are sent, and who listens there.
#pragma once

#include "report/object.h"

namespace report {

/// Its path, and the processes that have it open: kvd itself, the service manager that would start it.
Object describeService();

}  // namespace report
