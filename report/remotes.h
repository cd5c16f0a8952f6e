// The remotes, as kvd-receiver tells of them.
#pragma once

#include "report/object.h"

namespace report {

/// What `kvd-receiver --list` says, a text a line; null where it is not installed beside this program.
Object describeRemotes();

}  // namespace report
