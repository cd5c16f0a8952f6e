#include "platform/linux/system/local_socket.h"

#include <sys/socket.h>
#include <sys/un.h>

#include <algorithm>

namespace linux::system {

base::FileDescriptor connectTo(const std::string& path) {
  sockaddr_un address{};
  address.sun_family = AF_UNIX;
  if (path.empty() || path.size() >= sizeof address.sun_path) return base::FileDescriptor();
  std::ranges::copy(path, address.sun_path);
  base::FileDescriptor connection(socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0));
  if (!connection ||
      connect(connection.get(), reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0) {
    return base::FileDescriptor();
  }
  return connection;
}

pid_t listenerOf(int connection) {
  ucred peer{};
  socklen_t size = sizeof peer;
  return getsockopt(connection, SOL_SOCKET, SO_PEERCRED, &peer, &size) == 0 ? peer.pid : 0;
}

}  // namespace linux::system
