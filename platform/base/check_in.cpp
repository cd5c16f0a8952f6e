#include <sys/socket.h>

#include "platform/base/passed_socket.h"
#include "platform/base/port_names.h"
#include "platform/base/receive_queue.h"
#include "platform/base/service_socket.h"
#include "platform/base/sockets.h"

namespace base {
namespace {

/// A socket that sends to a bound one; none when that has no address.
FileDescriptor senderTo(const FileDescriptor& receiver) {
  sockaddr_un address{};
  socklen_t size = sizeof address;
  if (getsockname(receiver.get(), reinterpret_cast<sockaddr*>(&address), &size) != 0) return FileDescriptor();
  return address.sun_path[0] == '/' ? connectedSocket(address) : FileDescriptor();
}

}  // namespace
}  // namespace base

kern_return_t bootstrap_check_in(mach_port_t bootstrap, const char* service, mach_port_t* port) {
  if (bootstrap != base::kBootstrapPort || service == nullptr || port == nullptr)
    return KERN_INVALID_ARGUMENT;
  base::FileDescriptor socket = base::passedSocket(service);
  if (!socket) {
    const kern_return_t bound = base::bindServiceSocket(service, socket);
    if (bound != KERN_SUCCESS) return bound;
  }
  const int on = 1;
  if (setsockopt(socket.get(), SOL_SOCKET, SO_PASSCRED, &on, sizeof on) != 0) return KERN_FAILURE;
  *port = base::portName(service);
  base::setSendSocket(*port, base::senderTo(socket));
  base::openReceiveQueue(*port, std::move(socket));
  return KERN_SUCCESS;
}
