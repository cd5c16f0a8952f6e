// The keystroke helper: keys for one running program, or for the one in front.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace linux::roles {

/// The helper as scripts speak to it. Lives as long as the process.
tarnscript::Application& keyhouse();

}  // namespace linux::roles
