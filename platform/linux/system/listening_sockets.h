// The Unix sockets on which a process of this user listens.
#pragma once

#include <sys/types.h>

#include <string>
#include <vector>

namespace linux::system {

/// The paths of the Unix stream sockets on which it listens, in no particular order; empty where that cannot
/// be seen. Abstract ones are left out. Asks the kernel about the process's own sockets, one by one
/// (sock_diag(7)): the table of all of them, which /proc shows, is as long as any user of the machine likes.
std::vector<std::string> listeningSockets(pid_t process);

}  // namespace linux::system
