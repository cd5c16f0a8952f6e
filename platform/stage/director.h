// The director: reads commands, lets time pass and lets the daemon run, in a transcript or live at a
// terminal.
#pragma once

#include <functional>
#include <iosfwd>
#include <string>

#include "platform/stage/clock.h"

namespace stage {

/// Plays the commands of a descriptor in virtual time and writes the transcript: each command as it was read,
/// and indented under it what came of it. Lines that begin with a blank are somebody's earlier transcript and
/// are passed over. Runs the daemon from the first command that needs it. Returns the exit status: 1 when a
/// command was unknown or wrong.
int playTranscript(int input, std::ostream& output);

/// Runs the daemon in real time and takes commands from the terminal on standard input, until the daemon
/// ends. Returns the exit status.
int playLive(std::ostream& output);

// ---- For commands ----

/// Lets so much time pass before the next command, and does something then.
void waitThen(Nanoseconds duration, std::function<void()> then);
/// Stops reading commands and answers other processes until the daemon ends.
void serve();
/// Whether the daemon has run and ended.
bool daemonHasEnded();
/// Writes a line under the command in progress.
void say(const std::string& text);

}  // namespace stage
