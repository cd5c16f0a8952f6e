#include "platform/linux/system/turn.h"

#include <cstdint>
#include <set>

#include "platform/base/run_loop.h"

namespace linux::system {

namespace {

/// Who has timed out, and in which turn that was.
std::uint64_t sTurn = 0;
std::set<pid_t> sTimedOut;

void forgetEarlierTurns() {
  if (sTurn == base::turn()) return;
  sTurn = base::turn();
  sTimedOut.clear();
}

}  // namespace

void noteTimeout(pid_t process) {
  forgetEarlierTurns();
  if (process != 0) sTimedOut.insert(process);
}

bool timedOutThisTurn(pid_t process) {
  forgetEarlierTurns();
  return sTimedOut.contains(process);
}

}  // namespace linux::system
