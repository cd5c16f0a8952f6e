// What the kernel tells of the processes of this user.
#pragma once

#include <sys/types.h>

#include <cstdint>
#include <string>
#include <vector>

namespace linux::system {

/// The name of the file that it runs, without directories; empty where that cannot be seen.
std::string executableName(pid_t process);

/// When it started, in ticks since the machine did; 0 where that cannot be seen.
std::uint32_t startTime(pid_t process);

/// The paths of the Unix stream sockets on which it listens, in no particular order; empty where that cannot
/// be seen. Abstract ones are left out.
std::vector<std::string> listeningSockets(pid_t process);

}  // namespace linux::system
