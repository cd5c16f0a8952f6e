#include "platform/base/sockets.h"

#include <sys/socket.h>

#include <cerrno>

namespace base {

FileDescriptor datagramSocket() {
  return FileDescriptor(socket(AF_UNIX, SOCK_DGRAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0));
}

FileDescriptor connectedSocket(const sockaddr_un& address) {
  FileDescriptor end = datagramSocket();
  if (end && connect(end.get(), reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0) {
    const int reason = errno;
    end = FileDescriptor();
    errno = reason;
  }
  return end;
}

}  // namespace base
