// Which process is behind a window, and whether its workspace is shown, where the compositor tells that in a
// language of its own.
#pragma once

#include <sys/types.h>

#include <vector>

#include "platform/linux/windows/wlr/toplevels.h"

namespace linux::windows::wlr {

/// Asks the compositor for the processes of those windows that have none yet.
void findProcesses(pid_t compositor, const std::vector<Toplevel*>& windows);

/// Asks whether the window is on a workspace that is shown. True where the compositor does not tell.
bool isOnShownWorkspace(pid_t compositor, const Toplevel& window);

}  // namespace linux::windows::wlr
