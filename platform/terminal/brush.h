// Text into boxes of the screen.
#pragma once

#include <curses.h>

#include <string_view>

#include "platform/terminal/layout.h"

namespace terminal {

enum class Color : short { Green = 1, Cyan, Yellow, Red, Magenta };

/// Chooses the colours, once after the terminal was opened; none where the terminal has none or the user
/// wants none (https://no-color.org).
void chooseColors();

/// The colour as an attribute, or what stands for it where there are no colours.
attr_t colored(Color color, attr_t otherwise = A_NORMAL);

/// Writes into one row of a box what fits from a column of it on. Returns the column behind.
int put(const Box& box, int row, int column, std::wstring_view text, attr_t attributes = A_NORMAL);

/// The first row of a part: its name in a rule.
void putHeading(const Box& box, std::wstring_view name);

}  // namespace terminal
