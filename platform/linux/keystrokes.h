// Typing into a program, in front or not.
#pragma once

#include "platform/linux/keysyms.h"
#include "platform/linux/running.h"

namespace desktop {

/// The window of the program that a person would type into: the active one if it is the program's, else a
/// full-screen one, else the topmost. 0 when it has none.
Window keyboardWindow(const Instance& instance);

/// Presses and releases one key, given as parseKey reads it, in that window. False when the text is no key,
/// the keyboard has no such key or the program has no window.
bool type(const Instance& instance, std::string_view key);

}  // namespace desktop
