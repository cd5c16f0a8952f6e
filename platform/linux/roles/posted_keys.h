// Keys that the core posts to a program: done in the program's own way where deeds() has a row for them, else
// sent to its window as they are.
#pragma once

#include <cstdint>

#include "platform/linux/programs/running.h"

namespace desktop {

/// Presses a key of a virtual code. The window that took the press and is owed the release; 0 when there is
/// none.
Window pressKey(const Instance& instance, std::uint16_t virtualKey, std::uint16_t modifiers);

/// Releases a key in the window that took its press.
void releaseKey(Window window, std::uint16_t virtualKey, std::uint16_t modifiers);

}  // namespace desktop
