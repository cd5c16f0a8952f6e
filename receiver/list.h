// What --list says of the devices.
#pragma once

#include "receiver/arguments.h"

namespace receiver {

/// Prints every input device that could be a remote, whether it is one and why, and what keeps it from
/// working; then the HDMI-CEC adapters that pass no keys on. Returns the exit status.
int list(const Arguments& arguments);

}  // namespace receiver
