// Carrying a command out: from the arguments to messages on the daemon's port.
#pragma once

#include "remote/arguments.h"

namespace remote {

/// kvremote's exit statuses.
inline constexpr int kSent = 0;
inline constexpr int kNotSent = 1;
inline constexpr int kUsageError = 2;
inline constexpr int kQueueStayedFull = 3;

/// Sends what SendButton, SetScreenLocked or Terminate asks for and returns the exit status, with a line on
/// standard error where it was not sent. A hangup, interrupt or termination signal while a button is down
/// ends the wait, and the process once the release is sent.
int deliver(const Arguments& arguments);

}  // namespace remote
