// Keys through the shell's remote desktop: they go to the window in front.
//
// A session there takes a while to open, and the shell shows that it is open: it is opened ahead of the first
// key and closed when none has been sent for some minutes.
#pragma once

#include <cstdint>

#include "platform/linux/windows/backend.h"

namespace linux::windows::gnome {

/// Begins to open a session, once for each shell that comes, and waits for nothing.
void prepareKeyboard();

/// Presses or releases a key; waits for a session where there is none. False when there is no session to be
/// had.
bool tapKey(std::uint32_t keysym, bool down, Modifiers modifiers);

/// Closes the session, which releases its keys.
void dropKeyboard();

}  // namespace linux::windows::gnome
