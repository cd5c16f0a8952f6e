// The applications that scripts can name, as the desktop has them, but for what they would do.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace report {

/// Questions reach the desktop's own applications; commands, and properties that are set, are written down.
tarnscript::World& heldWorld();

}  // namespace report
