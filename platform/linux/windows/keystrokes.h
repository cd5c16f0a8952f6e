// Typing into a program, in front or not.
#pragma once

#include "platform/linux/windows/keysyms.h"
#include "platform/linux/programs/running.h"

namespace desktop {

/// The window of the program that a person would type into: the active one if it is the program's, else a
/// full-screen one, else the topmost. 0 when it has none.
Window keyboardWindow(const Instance& instance);

/// Presses and releases keys in that window, one after another: texts as parseKey reads them, one blank
/// apart. False when the first of them is no key, or one that the keyboard has not, or the program has no
/// window.
bool type(const Instance& instance, std::string_view keys);

}  // namespace desktop
