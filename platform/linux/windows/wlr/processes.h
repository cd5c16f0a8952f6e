// Which process is behind a window, and whether and where it is shown, as far as the compositor tells that in
// a language of its own.
#pragma once

#include <sys/types.h>

#include <vector>

#include "platform/linux/windows/wayland/toplevels.h"
#include "platform/linux/windows/wlr/container.h"

namespace linux::windows::wlr {

/// Asks the compositor for the processes of those windows that have none yet.
void findProcesses(pid_t compositor, const std::vector<wayland::Toplevel*>& windows);

/// Asks for all windows as they are now; none where the compositor does not tell.
std::vector<Container> readContainers(pid_t compositor);

}  // namespace linux::windows::wlr
