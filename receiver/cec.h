// HDMI-CEC adapters, whose remotes are mute until somebody switches them on.
#pragma once

#include <string>
#include <vector>

namespace receiver {

/// A line for each adapter that passes no keys on, or may pass none: which, and the command that switches it
/// on.
std::vector<std::string> adaptersWithoutKeys();

}  // namespace receiver
