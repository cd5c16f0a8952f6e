// The jukebox: the words of a music player.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace linux::roles {

/// The role as scripts speak to it. Lives as long as the process.
tarnscript::Application& jukebox();

}  // namespace linux::roles
