// The photo library: programs that show the photos of a directory, one after another.
//
// Their directories have no albums, and the scripts walk albums. So a list of albums is made up in which the
// current one always has a neighbour on either side; to select a neighbour is to go to the next or previous
// photo. The scripts for this generation send the first five albums on journeys of their own and stop at the
// last: the current one is the one between.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace linux::roles {

/// The role as scripts speak to it. Lives as long as the process.
tarnscript::Application& photoLibrary();

}  // namespace linux::roles
