// A keyboard of kvd's own on the person's seat. What is typed on it goes to the window in front.
#pragma once

#include <cstdint>

#include "platform/linux/windows/backend.h"
#include "platform/linux/windows/wayland/connection.h"

namespace linux::windows::wayland {

/// Keeps what makes keyboards.
void takeKeyboards(const Offer& offer);
void dropKeyboards();

/// Plugs one in; there is none where the compositor makes none, there is no seat, or it cannot be described.
void plugInKeyboard();
/// Pulls it out, which releases its keys.
void pullOutKeyboard();
/// Whether keys reach the window in front. The same for who only looks, and has no keyboard plugged in.
bool reachesFront();

/// Presses or releases a key; what comes of it is on its way with the connection's next flush. False when it
/// has no such key, and for the release of one that is not down.
bool tapKey(std::uint32_t keysym, bool down, Modifiers modifiers);

}  // namespace linux::windows::wayland
