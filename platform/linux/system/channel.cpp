#include "platform/linux/system/channel.h"

#include <poll.h>
#include <sys/socket.h>

#include <array>
#include <cerrno>
#include <map>

#include "platform/linux/system/listening_sockets.h"
#include "platform/linux/system/local_socket.h"
#include "platform/linux/system/process.h"

namespace linux::system {

namespace {

/// No answer that is waited for is that long.
constexpr std::size_t kLongestLine = 65536;

/// Where processes were found to listen.
constexpr std::size_t kMostPaths = 16;
std::map<pid_t, std::string> sPaths;

/// A connection to that path, if it is this process that takes it; none otherwise.
base::FileDescriptor connectToProcess(const std::string& path, pid_t process) {
  base::FileDescriptor connection = connectTo(path);
  if (!connection || listenerOf(connection.get()) != process) return base::FileDescriptor();
  return connection;
}

}  // namespace

std::string channelPath(const Listener& listener) {
  if (listener.process == 0 || executableName(listener.process) != listener.executable) return {};
  const auto known = sPaths.find(listener.process);
  if (known != sPaths.end()) return known->second;
  const auto paths = listeningSockets(listener.process);
  if (paths.empty()) return {};
  // Processes come and go; few are asked at a time.
  if (sPaths.size() >= kMostPaths) sPaths.clear();
  return sPaths[listener.process] = paths.front();
}

Channel::Channel(const Listener& listener, Limit limit) : limit_(patience(limit)), deadline_(limit_) {
  if (timedOutThisTurn(listener.process)) return;
  socket_ = connectToProcess(channelPath(listener), listener.process);
  if (socket_) return;
  // Another process may have had the number, or this one another socket.
  if (sPaths.erase(listener.process) > 0) socket_ = connectToProcess(channelPath(listener), listener.process);
}

bool Channel::waitFor(short events) {
  const bool ready = base::waitFor(socket_.get(), events, deadline_);
  if (!ready) noteTooLate();
  return ready;
}

void Channel::noteTooLate() {
  if (!timedOut_) noteWaitInVain(limit_);
  timedOut_ = true;
}

bool Channel::write(std::string_view text) {
  while (!text.empty()) {
    const ssize_t sent = ::send(socket_.get(), text.data(), text.size(), MSG_NOSIGNAL);
    if (sent > 0) {
      text.remove_prefix(static_cast<std::size_t>(sent));
    } else if (errno != EINTR && (errno != EAGAIN || !waitFor(POLLOUT))) {
      return false;
    }
  }
  return true;
}

std::optional<std::string> Channel::readLine() {
  // Whoever sends without a pause is never waited for, and runs out of time all the same.
  while (!deadline_.hasPassed()) {
    if (const std::size_t end = received_.find('\n'); end != std::string::npos) {
      std::string line = received_.substr(0, end);
      received_.erase(0, end + 1);
      if (line.ends_with('\r')) line.pop_back();
      return line;
    }
    std::array<char, 4096> part{};
    const ssize_t size = recv(socket_.get(), part.data(), part.size(), 0);
    if (size > 0 && received_.size() < kLongestLine) {
      received_.append(part.data(), static_cast<std::size_t>(size));
    } else if (size >= 0 || (errno != EINTR && (errno != EAGAIN || !waitFor(POLLIN)))) {
      return std::nullopt;
    }
  }
  noteTooLate();
  return std::nullopt;
}

}  // namespace linux::system
