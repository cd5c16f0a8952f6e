// What the kernel tells of the processes of this user.
#pragma once

#include <sys/types.h>

#include <cstdint>
#include <string>
#include <vector>

namespace linux::system {

/// The name of the file that it runs, without directories; empty where that cannot be seen.
std::string executableName(pid_t process);

/// All processes of this user, in no particular order.
std::vector<pid_t> ownProcesses();

/// When it started, in ticks since the machine did; 0 where that cannot be seen.
std::uint32_t startTime(pid_t process);

}  // namespace linux::system
