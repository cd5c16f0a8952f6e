// A rehearsal by transcript: commands in, the same commands with what came of them out.
#pragma once

#include <iosfwd>

namespace stage {

/// Plays the commands of a descriptor in virtual time and writes the transcript: each command as it was read,
/// and indented under it what came of it. Lines that begin with a blank are somebody's earlier transcript and
/// are passed over. Runs the daemon from the first command that needs it. Returns the exit status: 1 when the
/// daemon could not start or a command was unknown or wrong. Throws std::runtime_error where there is no
/// place for the service socket.
int playTranscript(int input, std::ostream& output);

/// Stops reading commands and answers other processes until the daemon ends; at a terminal it does that
/// anyway.
void serve();

}  // namespace stage
