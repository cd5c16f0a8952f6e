// Why something could not be done, for people: the one line that a program prints when it gives up.
#pragma once

#include <string>

namespace base {

/// Keeps what failed and what to do about it, one line without an end, in the place of what failed before.
void noteFailure(std::string line);

/// The line that was kept last; empty when nothing has failed.
const std::string& lastFailure();

}  // namespace base
