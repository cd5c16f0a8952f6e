// The programs that take the remote themselves: media centres and their like, which read its keys as the keys
// of a keyboard.
#pragma once

#include <string>

namespace linux::programs {

/// The program in front, by its name, where it takes the remote itself; empty where it does not. Where nobody
/// can tell who is in front, one that runs counts as being there. Goes by what windows::takeIn has taken in,
/// and without an answer there by the processes.
std::string takerOfRemote();

}  // namespace linux::programs
