// The back end of a desktop that says nothing.
#pragma once

#include "platform/linux/windows/backend.h"

namespace linux::windows {

/// Does nothing, completely: it is never open, knows no window and takes no key.
extern const Backend kNone;

}  // namespace linux::windows
