// The windows that the window manager manages.
#pragma once

#include <span>
#include <vector>

#include "platform/linux/windows/window.h"

namespace linux::windows::x11 {

/// Takes in what the X server has sent. True when windows came or went, or changed their order, whose they
/// are or which is active, since the last call.
bool takeInClients();

/// As of the last takeInClients, topmost first.
const std::vector<Window>& clients();

/// Asks how windows look now. All questions are sent before the first answer is waited for.
void look(std::span<Window> windows);

}  // namespace linux::windows::x11
