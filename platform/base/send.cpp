// The sending side of a port: look it up, put messages into its queue.
#include <poll.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <chrono>
#include <cstring>
#include <limits>
#include <optional>

#include "platform/base/failure.h"
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

/// Whether something else is in the socket's place: no socket, or one that is not the directory's owner's.
/// What reads from a datagram socket does not tell who it is.
bool isForeign(const sockaddr_un& address, const std::string& directory) {
  struct stat place {};
  struct stat there {};
  if (lstat(address.sun_path, &there) != 0 || stat(directory.c_str(), &place) != 0) return false;
  return !S_ISSOCK(there.st_mode) || there.st_uid != place.st_uid;
}

kern_return_t nobodyThere(const std::string& line) {
  base::noteFailure(line);
  return BOOTSTRAP_UNKNOWN_SERVICE;
}

}  // namespace

kern_return_t bootstrap_look_up(mach_port_t bootstrap, const char* service, mach_port_t* port) {
  if (bootstrap != base::kBootstrapPort || service == nullptr || port == nullptr)
    return KERN_INVALID_ARGUMENT;
  const auto directory = base::serviceDirectory(base::Side::Sends);
  const auto address = directory ? base::serviceAddress(*directory, service) : std::nullopt;
  if (!address) return BOOTSTRAP_UNKNOWN_SERVICE;
  const std::string path = address->sun_path;
  if (isForeign(*address, *directory)) return nobodyThere(path + " is not the socket of a kvd; remove it");
  base::FileDescriptor socket = base::connectedSocket(*address);
  if (!socket) return nobodyThere("nobody is listening on " + path);
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
