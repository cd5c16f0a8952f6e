// Starting programs.
#pragma once

#include "platform/linux/programs/entry.h"

namespace linux::programs {

/// The default program of a role: for the jukebox the person's own choice for music files, if it plays that
/// role; else the first installed one of the table; else any installed one. Null where there is none.
const Entry* defaultProgramOf(Role role);

/// Starts the default program of a role. It does not become a child
/// of this process. Does nothing while one that was started has yet to appear, and where none is installed.
void launchProgramOf(Role role);

}  // namespace linux::programs
