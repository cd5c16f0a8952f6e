// Keys that the core posts to a program: done in the program's own way where it has an action for them, else
// sent to its window as they are.
#pragma once

#include <cstdint>

#include "platform/linux/roles/performer.h"

namespace linux::roles {

/// Presses a key of a virtual code. The window that took the press and is owed the release; none when there
/// is none.
windows::ID pressKey(const Performer& performer, std::uint16_t virtualKey, windows::Modifiers modifiers);

/// Releases a key in the window that took its press.
void releaseKey(windows::ID window, std::uint16_t virtualKey, windows::Modifiers modifiers);

}  // namespace linux::roles
