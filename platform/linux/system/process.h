// What the kernel tells of the processes of this user.
#pragma once

#include <sys/types.h>

#include <string>
#include <vector>

namespace desktop {

/// The name of the file that it runs, without directories; empty where that cannot be seen.
std::string executableName(pid_t process);

/// The paths of the Unix stream sockets on which it listens, in no particular order; empty where that cannot
/// be seen. Abstract ones are left out.
std::vector<std::string> listeningSockets(pid_t process);

}  // namespace desktop
