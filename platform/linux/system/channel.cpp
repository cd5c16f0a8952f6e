#include "platform/linux/system/channel.h"

#include <poll.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstring>
#include <map>

#include "platform/host.h"
#include "platform/linux/system/process.h"

namespace desktop {

namespace {

/// No answer that is waited for is that long.
constexpr std::size_t kLongestLine = 65536;

/// Where processes were found to listen.
constexpr std::size_t kMostPaths = 16;
std::map<pid_t, std::string> sPaths;

/// A connection to that path, if it is this process that takes it; -1 otherwise.
int connectTo(const std::string& path, pid_t process) {
  sockaddr_un address{};
  address.sun_family = AF_UNIX;
  if (path.empty() || path.size() >= sizeof address.sun_path) return -1;
  std::memcpy(address.sun_path, path.data(), path.size());
  const int fd = socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0);
  if (fd < 0) return -1;
  ucred peer{};
  socklen_t size = sizeof peer;
  if (connect(fd, reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0 &&
      getsockopt(fd, SOL_SOCKET, SO_PEERCRED, &peer, &size) == 0 && peer.pid == process) {
    return fd;
  }
  close(fd);
  return -1;
}

}  // namespace

std::string channelPath(pid_t process, std::string_view executable) {
  if (process == 0 || executableName(process) != executable) return {};
  const auto known = sPaths.find(process);
  if (known != sPaths.end()) return known->second;
  const auto paths = listeningSockets(process);
  if (paths.empty()) return {};
  // Processes come and go; few are asked at a time.
  if (sPaths.size() >= kMostPaths) sPaths.clear();
  return sPaths[process] = paths.front();
}

Channel::Channel(pid_t process, std::string_view executable, Microseconds limit)
    : deadline_(HostAbsoluteTime() + static_cast<double>(limit) / 1e6) {
  if (timedOutThisTurn(process)) return;
  socket_ = connectTo(channelPath(process, executable), process);
  if (socket_ >= 0) return;
  // Another process may have had the number, or this one another socket.
  if (sPaths.erase(process) > 0) socket_ = connectTo(channelPath(process, executable), process);
}

Channel::~Channel() {
  if (socket_ >= 0) close(socket_);
}

bool Channel::waitFor(short events) {
  pollfd watched{socket_, events, 0};
  const double left = deadline_ - HostAbsoluteTime();
  const int ready = left > 0 ? poll(&watched, 1, static_cast<int>(left * 1e3) + 1) : 0;
  timedOut_ = ready == 0;
  return ready > 0 || (ready < 0 && errno == EINTR);
}

bool Channel::write(std::string_view text) {
  while (!text.empty()) {
    const ssize_t sent = ::send(socket_, text.data(), text.size(), MSG_NOSIGNAL);
    if (sent > 0) {
      text.remove_prefix(static_cast<std::size_t>(sent));
    } else if (errno != EINTR && (errno != EAGAIN || !waitFor(POLLOUT))) {
      return false;
    }
  }
  return true;
}

std::optional<std::string> Channel::readLine() {
  std::size_t end = 0;
  while ((end = received_.find('\n')) == std::string::npos) {
    std::array<char, 4096> part{};
    const ssize_t size = recv(socket_, part.data(), part.size(), 0);
    if (size > 0 && received_.size() < kLongestLine) {
      received_.append(part.data(), static_cast<std::size_t>(size));
    } else if (size >= 0 || (errno != EINTR && (errno != EAGAIN || !waitFor(POLLIN)))) {
      return std::nullopt;
    }
  }
  std::string line = received_.substr(0, end);
  received_.erase(0, end + 1);
  if (line.ends_with('\r')) line.pop_back();
  return line;
}

}  // namespace desktop
