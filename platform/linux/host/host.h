// The real desktop as a host, put together and taken apart.
#pragma once

#include <vector>

#include "platform/linux/windows/windows.h"

namespace linux::host {

/// Puts the host together: what a start needs, the windows by these back ends, what scripts can name.
/// Connections are made when they are first needed.
void init(std::vector<const windows::Backend*> backends, windows::Use use = windows::Use::Typing);

/// Closes what was opened since. What was sent gets through.
void finish();

}  // namespace linux::host
