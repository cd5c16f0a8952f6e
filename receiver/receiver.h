// The receiver itself: from the remotes to the daemon's port.
#pragma once

#include "receiver/arguments.h"

namespace receiver {

/// Turns what the remotes send into messages to the daemon until SIGTERM, SIGINT or SIGHUP, with --monitor
/// telling on standard output what comes and what is sent. Returns the exit status; throws std::exception
/// where it cannot start.
int run(const Arguments& arguments);

}  // namespace receiver
