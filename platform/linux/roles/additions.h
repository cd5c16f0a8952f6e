// The commands of no application in particular: the output volume.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace linux::roles {

/// "get volume settings" and "set volume" on the default sink. Borrowed; lives as long as the process.
tarnscript::Application& additions();

}  // namespace linux::roles
