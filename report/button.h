// A button rehearsed: the core deals with it as it would now, and what it would do is written down.
#pragma once

#include "remote/buttons.h"
#include "report/object.h"

namespace report {

/// Who would get a tap of the button and by which rule, who would be silenced first, what would be said.
/// Nothing is done. The back ends must have been given to the host.
Object describeButton(const remote::Button& button);

}  // namespace report
