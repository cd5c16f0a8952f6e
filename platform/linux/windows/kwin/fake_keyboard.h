// Keys by org_kde_kwin_fake_input, for the window in front, as if they were typed on the person's own
// keyboard.
#pragma once

#include <cstdint>

#include "platform/linux/windows/backend.h"
#include "platform/linux/windows/wayland/connection.h"

namespace linux::windows::kwin {

/// Keeps what takes keys.
void takeFakeInput(const wayland::Offer& offer);
void dropFakeInput();

/// Makes it ready: from here on it follows the layout of the seat's keyboard.
void prepareKeyboard();
bool hasKeyboard();

/// Presses or releases a key; what comes of it is on its way with the connection's next flush. False when the
/// keyboard has no such key, and for the release of one that is not down.
bool tapKey(std::uint32_t keysym, bool down, Modifiers modifiers);

}  // namespace linux::windows::kwin
