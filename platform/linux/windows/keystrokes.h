// Typing into a program, in front or not.
#pragma once

#include <span>
#include <string_view>

#include "platform/linux/windows/window.h"

namespace linux::windows {

/// Of a program's windows, topmost first, the one that a person would type into: the active one, else a
/// full-screen one, else the topmost. Null when there is none. Borrowed.
const Window* keyboardWindow(std::span<const Window> windows);

/// Presses and releases keys in a window, one after another: texts as parseKey reads them, one blank apart.
/// False when the first of them is no key, or one that the keyboard has not, or the window cannot be reached.
bool type(ID window, std::string_view keys);

}  // namespace linux::windows
