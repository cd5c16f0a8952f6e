// The windows of which a script in KWin reports over the session bus: for where no desktop entry lets kvd
// ask.
#pragma once

#include "platform/linux/windows/kwin/source.h"

namespace linux::windows::kwin {

/// Has KWin run the script, unless it does; tried at most once a turn of the run loop. Whether it has
/// reported.
bool openReports();
/// Ends that, and forgets all windows.
void closeReports();

extern const Source kReports;

}  // namespace linux::windows::kwin
