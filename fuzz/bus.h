// A session bus with one other program on it, in this process, in the place of platform/linux/system/bus.cpp.
//
// An input tells in lines what the program says: the name of a method and what it answers, as busctl(1)
// writes values
// ("GetAll a{sv} 1 Volume d 0.5"), or the name of a signal, or of a method of kvd's, and its arguments. Of
// several answers to one method each is given once, and the last one for ever.
#pragma once

#include <string_view>

namespace fuzz {

/// The program's name on the bus.
inline constexpr char kProgram[] = ":1.7";

/// Connects kvd to a new bus with a program that says these lines, borrowed; and what it says unasked is on
/// its way.
void beginBus(std::string_view lines);

}  // namespace fuzz
