// The rehearsal desktop on a full screen.
#pragma once

#include <optional>

namespace terminal {

/// Runs the daemon in real time and shows the desktop on the terminal at standard input and output, until the
/// daemon ends. Returns the daemon's exit status, the terminal being as it was; nothing, with nothing done,
/// when this terminal cannot show a screen.
std::optional<int> play();

}  // namespace terminal
