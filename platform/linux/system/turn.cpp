#include "platform/linux/system/turn.h"

#include <algorithm>
#include <cstdint>
#include <set>

#include "platform/base/run_loop.h"

namespace linux::system {

namespace {

/// The longest that a turn waits in vain before it loses its patience, and what it has left then.
constexpr Limit kPatience = std::chrono::seconds(1);
constexpr Limit kImpatience = std::chrono::milliseconds(20);

/// Who has timed out, how long was waited in vain, and in which turn that was.
std::uint64_t sTurn = 0;
std::set<pid_t> sTimedOut;
Limit sWaited{};

void forgetEarlierTurns() {
  if (sTurn == base::turn()) return;
  sTurn = base::turn();
  sTimedOut.clear();
  sWaited = {};
}

}  // namespace

Limit patience(Limit limit) {
  forgetEarlierTurns();
  return sWaited < kPatience ? limit : std::min(limit, kImpatience);
}

void noteWaitInVain(Limit waited) {
  forgetEarlierTurns();
  sWaited += waited;
}

void noteTimeout(pid_t process) {
  forgetEarlierTurns();
  if (process != 0) sTimedOut.insert(process);
}

bool timedOutThisTurn(pid_t process) {
  forgetEarlierTurns();
  return sTimedOut.contains(process);
}

}  // namespace linux::system
