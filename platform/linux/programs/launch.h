// Starting programs.
#pragma once

#include "platform/linux/programs/role.h"

namespace linux::programs {

/// Starts the default program of a role: for the jukebox the person's own choice for music files, if it plays
/// that role; else the first installed one of the table; else any installed one. It does not become a child
/// of this process. Does nothing while one that was started has yet to appear, and where none is installed.
void launchProgramOf(Role role);

}  // namespace linux::programs
