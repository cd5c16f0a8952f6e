// A keyboard of kvd's own on the person's seat. What is typed on it goes to the window in front.
#pragma once

#include <cstdint>

#include "platform/linux/windows/backend.h"

struct wl_seat;
struct zwp_virtual_keyboard_manager_v1;

namespace linux::windows::wlr {

/// Plugs it in; there is none where the keyboard cannot be described.
void makeKeyboard(zwp_virtual_keyboard_manager_v1* manager, wl_seat* seat);
/// Pulls it out, which releases its keys.
void dropKeyboard();
bool hasKeyboard();

/// Presses or releases a key; what comes of it is on its way with the connection's next flush. False when it
/// has no such key, and for the release of one that is not down.
bool tapKey(std::uint32_t keysym, bool down, Modifiers modifiers);

}  // namespace linux::windows::wlr
