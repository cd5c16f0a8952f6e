// The two movie players. They differ in their words and in the scale of their volume.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace linux::roles {

// The roles as scripts speak to them. They live as long as the process.
tarnscript::Application& classicMovies();
tarnscript::Application& modernMovies();

}  // namespace linux::roles
