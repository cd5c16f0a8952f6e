// What kvd sees of the desktop at this moment.
#pragma once

#include "report/object.h"

namespace report {

/// The session, who tells of windows, who is in front, who plays which role and who none, outputs, sound, the
/// service. The back ends must have been given to the host.
Object describeDesktop();

}  // namespace report
