// What objects a program has on the session bus.
#pragma once

#include <string>
#include <vector>

#include "platform/linux/system/bus.h"

namespace linux::system {

/// The names of the objects right below a path, as the program tells them now, and no more than a program
/// has windows. None when there is no answer.
std::vector<std::string> childrenOf(const Callee& callee, const char* path);

}  // namespace linux::system
