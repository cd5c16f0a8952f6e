// For code whose state has no reset: an input plays in a process of its own, and libFuzzer sees what it
// covered.
#pragma once

#include <functional>
#include <string>

namespace fuzz {

/// What `play` returns, played in a child process. It must come to its end there.
std::string inChild(const std::function<std::string()>& play);

}  // namespace fuzz
