// Commands played in virtual time beside a rehearsal that goes on.
#pragma once

#include <optional>
#include <string>

namespace stage {

/// Plays the commands in a process of its own, on a fresh desktop. Returns the transcript; nothing when it
/// could not be played to its end.
std::optional<std::string> playAgain(const std::string& commands);

}  // namespace stage
