// The presentation program: a document is open, and its show plays in a full-screen window.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace linux::roles {

/// The role as scripts speak to it. Lives as long as the process.
tarnscript::Application& presentation();

}  // namespace linux::roles
