// Which process is behind a window, and whether and where it is shown, as far as the compositor tells that in
// a language of its own.
#pragma once

#include <sys/types.h>

#include <optional>
#include <vector>

#include "platform/linux/windows/wayland/toplevels.h"
#include "platform/linux/windows/wlr/container.h"

namespace linux::windows::wlr {

/// Asks the compositor for the processes of those windows that have none yet.
void findProcesses(pid_t compositor, const std::vector<wayland::Toplevel*>& windows);

/// Asks for the window as it is now; nothing where the compositor does not tell.
std::optional<Container> lookAt(pid_t compositor, const wayland::Toplevel& window);

}  // namespace linux::windows::wlr
