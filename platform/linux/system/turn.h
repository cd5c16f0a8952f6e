// How long a program may keep kvd waiting, and that one which did is left alone for the rest of the turn.
//
// A button runs several scripts in one turn of the run loop, and each may ask the same player several things.
// A player that hangs costs the first question's limit once, not once a question; and what all of them cost
// together has a limit too.
#pragma once

#include <sys/types.h>

#include <chrono>

namespace linux::system {

/// How long something may be waited for.
using Limit = std::chrono::microseconds;

/// The longest wait for the answer to a question, and for the acknowledgement of a command.
inline constexpr Limit kQueryLimit = std::chrono::milliseconds(500);
inline constexpr Limit kCommandLimit = std::chrono::seconds(1);

/// How long to wait next: the limit, and hardly any time once this turn has waited in vain for a second in
/// all. Many programs that hang may cost a button no more than one or two.
Limit patience(Limit limit);

/// Notes that a wait of this length has run out, whoever was waited for.
void noteWaitInVain(Limit waited);

/// Notes that the process has let a wait run out.
void noteTimeout(pid_t process);

/// Whether the process has let a wait run out in this turn. False for 0, which stands for no process of
/// interest.
bool timedOutThisTurn(pid_t process);

}  // namespace linux::system
