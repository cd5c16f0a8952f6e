// The applications that scripts can name on the real desktop.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace linux::roles {

/// The roles, the keystroke helper and the additions. Lives as long as the process.
tarnscript::World& world();

}  // namespace linux::roles
