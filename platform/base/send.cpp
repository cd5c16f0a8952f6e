// The sending side of a port: look it up, put messages into its queue.
#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <chrono>
#include <cstring>
#include <limits>
#include <optional>

#include "platform/base/port_names.h"
#include "platform/base/service_directory.h"
#include "platform/base/sockets.h"

namespace {

using Clock = std::chrono::steady_clock;

/// The sender's identity goes with every message: one that is queued before the receiver asks for identities
/// would arrive without.
ssize_t sendWithCredentials(int socket, void* bytes, std::size_t size) {
  const ucred self{.pid = getpid(), .uid = geteuid(), .gid = getegid()};
  alignas(cmsghdr) std::array<char, CMSG_SPACE(sizeof self)> control{};
  iovec body{.iov_base = bytes, .iov_len = size};
  msghdr datagram{};
  datagram.msg_iov = &body;
  datagram.msg_iovlen = 1;
  datagram.msg_control = control.data();
  datagram.msg_controllen = control.size();
  cmsghdr* credentials = CMSG_FIRSTHDR(&datagram);
  credentials->cmsg_level = SOL_SOCKET;
  credentials->cmsg_type = SCM_CREDENTIALS;
  credentials->cmsg_len = CMSG_LEN(sizeof self);
  std::memcpy(CMSG_DATA(credentials), &self, sizeof self);
  return sendmsg(socket, &datagram, MSG_NOSIGNAL | MSG_DONTWAIT);
}

mach_msg_return_t resultOf(int error) {
  switch (error) {
    case ECONNREFUSED:
    case ECONNRESET:
    case ENOENT:
    case ENOTCONN:
    case EPIPE:
      return MACH_SEND_INVALID_DEST;
    default:
      return MACH_SEND_INVALID_DATA;
  }
}

/// Waits until there may be room in the peer's queue, or the peer is gone. False when the deadline has
/// passed.
bool waitForRoom(int socket, std::optional<Clock::time_point> deadline) {
  int timeout = -1;
  if (deadline) {
    // Rounded up: waiting for the last part of a millisecond must not become a spin.
    const auto left = std::chrono::ceil<std::chrono::milliseconds>(*deadline - Clock::now()).count();
    if (left <= 0) return false;
    timeout = static_cast<int>(std::min<std::int64_t>(left, std::numeric_limits<int>::max()));
  }
  pollfd writable{.fd = socket, .events = POLLOUT, .revents = 0};
  poll(&writable, 1, timeout);
  return true;
}

}  // namespace

kern_return_t bootstrap_look_up(mach_port_t bootstrap, const char* service, mach_port_t* port) {
  if (bootstrap != base::kBootstrapPort || service == nullptr || port == nullptr)
    return KERN_INVALID_ARGUMENT;
  const auto directory = base::serviceDirectory(false);
  const auto address = directory ? base::serviceAddress(*directory, service) : std::nullopt;
  if (!address) return BOOTSTRAP_UNKNOWN_SERVICE;
  base::FileDescriptor socket = base::connectedSocket(*address);
  if (!socket) return BOOTSTRAP_UNKNOWN_SERVICE;
  *port = base::portName(service);
  base::setSendSocket(*port, std::move(socket));
  return KERN_SUCCESS;
}

mach_msg_return_t mach_msg(mach_msg_header_t* message, mach_msg_option_t option, mach_msg_size_t send_size,
                           mach_msg_size_t /*receive_size*/, mach_port_t /*receive_port*/,
                           mach_msg_timeout_t timeout, mach_port_t /*notify_port*/) {
  if ((option & ~MACH_SEND_TIMEOUT) != MACH_SEND_MSG) return KERN_INVALID_ARGUMENT;
  if (message == nullptr) return MACH_SEND_INVALID_DATA;
  if (send_size < sizeof *message) return MACH_SEND_MSG_TOO_SMALL;
  const mach_port_t name = message->msgh_remote_port;
  const int socket = base::sendSocket(name);
  if (socket < 0) return MACH_SEND_INVALID_DEST;

  message->msgh_size = send_size;
  std::optional<Clock::time_point> deadline;
  if ((option & MACH_SEND_TIMEOUT) != 0) deadline = Clock::now() + std::chrono::milliseconds(timeout);
  while (sendWithCredentials(socket, message, send_size) < 0) {
    if (errno == EINTR) continue;
    if (errno != EAGAIN) return resultOf(errno);
    if (base::makeRoom != nullptr && base::makeRoom(name)) continue;
    if (!waitForRoom(socket, deadline)) return MACH_SEND_TIMED_OUT;
  }
  return MACH_MSG_SUCCESS;
}
