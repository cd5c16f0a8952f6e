// Who else has a device open.
#pragma once

#include <string>

namespace receiver {

/// The other processes that have a device node open, as far as /proc shows them: ": NAME (PID), …"; empty
/// when it shows none.
std::string holdersOf(const std::string& path);

}  // namespace receiver
