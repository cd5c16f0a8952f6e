// Where the session's window systems listen.
#pragma once

#include <optional>
#include <string>
#include <vector>

namespace linux::windows {

/// The service manager's environment, "NAME=value" each; nothing where no service manager is on the bus.
std::optional<std::vector<std::string>> serviceManagerEnvironment();

/// Takes DISPLAY, WAYLAND_DISPLAY and what goes with them from the service manager's environment into this
/// process's own: a desktop may tell them to the service manager after this service was started. Asks at most
/// once a turn of the run loop; true when one has changed in this turn.
bool takeSessionEnvironment();

}  // namespace linux::windows
