#include "platform/stage/director.h"

#include <utility>

#include "daemon/lifecycle.h"
#include "platform/stage/commands.h"
#include "platform/stage/desktop.h"
#include "platform/stage/quantities.h"

namespace stage {

namespace {

std::optional<Nanoseconds> sWaitEnd;
std::function<void()> sThen;

bool sDaemonEnded = false;

std::function<void(const std::string&)> sKeeper;

}  // namespace

void beginRehearsal(base::TimeSource time, std::function<void(const JournalLine&)> listener) {
  base::setTimeSource(std::move(time));
  base::setTimerObserver([](const base::Timer& timer, bool started) {
    record(Entry::Timer, "timer of " + timeText(timer.period) + (started ? " starts" : " stops"));
  });
  setJournalListener(std::move(listener));
}

bool performCommand(const std::string& line) {
  const std::optional<std::string> error = runCommand(line);
  if (error) record(Entry::Error, "error: " + *error);
  return !error;
}

int runDaemon() {
  base::endLoopOnSignals();
  const int status = KVDMain();
  sDaemonEnded = true;
  record(Entry::Exit, "exit status " + std::to_string(status));
  return status;
}

std::optional<Nanoseconds> waitEnd() { return sWaitEnd; }

void finishWait() {
  sWaitEnd.reset();
  if (const auto then = std::exchange(sThen, nullptr)) then();
}

void letTimePass(std::optional<Nanoseconds> deadline) {
  const Nanoseconds end = *waitEnd();
  const Nanoseconds next = *earlier(earlier(end, deadline), nextDesktopChange());
  advanceTo(next);
  advanceDesktop();
  const bool timerIsDue = deadline && *deadline <= next;
  if (next == end && !timerIsDue) finishWait();
}

void waitThen(Nanoseconds duration, std::function<void()> then) {
  if (sWaitEnd) finishWait();
  sWaitEnd = now() + duration;
  sThen = std::move(then);
}

void setKeeper(std::function<void(const std::string&)> keeper) { sKeeper = std::move(keeper); }

void keep(const std::string& command) {
  if (sKeeper) sKeeper(command);
}

bool daemonHasEnded() { return sDaemonEnded; }

void say(const std::string& text) { record(Entry::Remark, text); }

}  // namespace stage
