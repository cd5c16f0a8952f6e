// How long a program may keep kvd waiting, and that one which did is left alone for the rest of the turn.
//
// A button runs several scripts in one turn of the run loop, and each may ask the same player several things.
// A player that hangs costs the first question's limit once, not once a question.
#pragma once

#include <sys/types.h>

#include <cstdint>

namespace desktop {

/// Microseconds.
using Microseconds = std::uint64_t;

/// The longest wait for the answer to a question, and for the acknowledgement of a command.
inline constexpr Microseconds kQueryLimit = 500'000;
inline constexpr Microseconds kCommandLimit = 1'000'000;

/// Notes that the process has let a wait run out.
void noteTimeout(pid_t process);

/// Whether the process has let a wait run out in this turn. False for 0, which stands for no process of
/// interest.
bool timedOutThisTurn(pid_t process);

}  // namespace desktop
