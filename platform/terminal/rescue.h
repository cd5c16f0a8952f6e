// The terminal when the program dies under it.
#pragma once

#include <termios.h>

namespace terminal {

/// From here on the terminal is given back as it was before a signal that nobody takes ends the program: a
/// crash, an abort, or one from outside. To be called once, when curses has the terminal; `found` are its
/// modes from before.
void rescueTerminal(const termios& found);

/// The terminal was given back in good order: from here on such a signal leaves it alone.
void leaveTerminal();

}  // namespace terminal
