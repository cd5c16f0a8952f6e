// Keys and wishes for one window.
#pragma once

#include <cstdint>

#include "platform/linux/windows/backend.h"

namespace linux::windows::x11 {

/// Sends a press or release of a key to one window and to nothing else, in the way that the most toolkits
/// accept. False when the keyboard has no such key or the window is gone.
bool sendKey(std::uint64_t window, std::uint32_t keysym, bool down, Modifiers modifiers);

/// Asks the window manager to activate the window.
void activate(std::uint64_t window);

}  // namespace linux::windows::x11
