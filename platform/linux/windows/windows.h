// The windows of the desktop, whichever window systems there are.
//
// The back ends that open are asked, and what they say is merged: over XWayland two of them know a part each,
// and some windows both. Without any, every question is answered with nothing.
#pragma once

#include <cstdint>
#include <span>
#include <vector>

#include "platform/linux/windows/backend.h"

namespace linux::windows {

/// What windows are wanted for.
enum class Use : std::uint8_t { Looking, Typing };

/// The back ends to be asked from here on; where two know the same, the earlier one is believed. Who only
/// looks can send no keys, and has no keyboards made.
void init(std::vector<const Backend*> backends, Use use = Use::Typing);
/// Closes them.
void finish();
/// Those of init, in their order.
std::span<const Backend* const> backends();

/// Whether any back end is open.
bool isOpen();

/// Takes in what the window systems have sent. True when windows came or went, changed their order, whose
/// they are or which is active since the last call.
bool takeIn();

/// All windows, topmost first. Valid until takeIn, as what front lends.
const std::vector<Window>& list();

/// The active window; null where there is none, and where nobody can tell.
const Window* front();
/// Whether anybody can tell.
bool knowsFront();

/// These windows as they look now, those that have gone left out.
std::vector<Window> look(std::span<const ID> windows);

/// Asks for the window to come to the front.
void activate(ID window);

/// Sends a press or release of a key, an X keysym, to one window and to nothing else. False when it cannot be
/// reached, is gone, or the keyboard has no such key.
bool sendKey(ID window, std::uint32_t keysym, bool down, Modifiers modifiers);

/// Whether sendKey would reach the window now.
bool takesKeys(ID window);

/// The active outputs, by the first back end that tells of any: an X server beside a compositor shows on the
/// same ones, and does not know what else is there.
std::vector<Output> outputs();

/// Whether a shown full-screen window covers most of the output with this number.
bool isCaptured(std::uint32_t id);

}  // namespace linux::windows
