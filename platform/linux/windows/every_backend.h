// The window systems that kvd knows.
#pragma once

#include <vector>

#include "platform/linux/windows/backend.h"

namespace linux::windows {

/// All of them, in the order in which they are believed.
std::vector<const Backend*> everyBackend();

}  // namespace linux::windows
