// A host that fails once, at every call in turn.
#pragma once

#include <string>
#include <vector>

namespace simulator {

/// Plays a scene, commands of the desktop, once for each call by which the daemon asks something of the host,
/// and lets that call fail. Whatever fails, the next button must work and nothing may be left over. Prints
/// how many calls there were, and a failure with its transcript. False when a promise was broken.
bool failEachCall(const std::string& name, const std::vector<std::string>& scene);

}  // namespace simulator
