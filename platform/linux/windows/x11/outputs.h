// The outputs that show something (RandR 1.5).
#pragma once

#include <vector>

#include "platform/linux/windows/window.h"

namespace linux::windows::x11 {

/// The active outputs, or the whole screen as one where the server does not tell them; none without a server.
std::vector<Output> outputs();

}  // namespace linux::windows::x11
