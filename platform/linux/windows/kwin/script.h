// The windows of which a script in KWin tells, over the session bus: for where no desktop entry lets kvd ask.
//
// KWin keeps a script until it is told to let go of it, or ends.
#pragma once

#include "platform/linux/windows/kwin/source.h"

namespace linux::windows::kwin {

/// Has KWin run the script, unless it does; tried at most once a turn of the run loop. Whether it has told of
/// windows.
bool openScript();
/// Has KWin let go of it, and forgets all windows.
void closeScript();

extern const Source kScript;

}  // namespace linux::windows::kwin
