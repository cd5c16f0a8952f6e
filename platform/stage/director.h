// The director: what both ways to play a rehearsal share. Commands are performed, time is let pass, the
// daemon runs.
#pragma once

#include <functional>
#include <optional>
#include <string>

#include "platform/base/run_loop.h"
#include "platform/stage/clock.h"
#include "platform/stage/journal.h"

namespace stage {

// ---- For the ways to play ----

/// Sets the run loop's time and where the journal goes.
void beginRehearsal(base::TimeSource time, std::function<void(const JournalLine& line)> listener);
/// Performs a command and journals what is wrong with it. False when something was.
bool performCommand(const std::string& line);
/// Runs the daemon to its end. Returns its exit status, which the journal tells too.
int runDaemon();
/// When the command in progress has let enough time pass; nothing when none does.
std::optional<Nanoseconds> waitEnd();
/// Ends that wait and does what was to be done then.
void finishWait();
/// In virtual time, during such a wait: moves time to the next thing that happens, or to the wait's end.
/// `deadline` is when the run loop's next timer is due, if there is one.
void letTimePass(std::optional<Nanoseconds> deadline);
/// Where it goes what was done at the desktop, in the words of commands; nowhere when empty.
void setKeeper(std::function<void(const std::string& command)> keeper);

// ---- For commands ----

/// Lets so much time pass before the next command, and does something then.
void waitThen(Nanoseconds duration, std::function<void()> then);
/// Whether the daemon has run and ended.
bool daemonHasEnded();
/// Keeps what was done, where somebody keeps it.
void keep(const std::string& command);
/// Answers the person at the desktop.
void say(const std::string& text);

}  // namespace stage
