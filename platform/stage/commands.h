// The commands of the rehearsal desktop.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace stage {

/// Performs one command line; blank lines and those that begin with # are none. What is wrong with it, in one
/// line, or nothing.
std::optional<std::string> runCommand(std::string_view line);

/// Whether the line needs a running daemon.
bool needsDaemon(std::string_view line);

/// Asks the daemon to end, by message.
void terminateDaemon();

}  // namespace stage
