// The disc player: discs with menus and chapters, and plain files as if they had some.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace linux::roles {

/// The role as scripts speak to it. Lives as long as the process.
tarnscript::Application& discPlayer();

}  // namespace linux::roles
