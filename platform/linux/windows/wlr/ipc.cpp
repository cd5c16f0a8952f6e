#include "platform/linux/windows/wlr/ipc.h"

#include <poll.h>
#include <sys/socket.h>

#include <algorithm>
#include <array>
#include <cerrno>

#include "platform/linux/system/local_socket.h"

namespace linux::windows::wlr {

base::FileDescriptor connectTo(const std::string& path, pid_t compositor) {
  base::FileDescriptor socket = system::connectTo(path);
  return socket && system::listenerOf(socket.get()) == compositor ? std::move(socket)
                                                                  : base::FileDescriptor();
}

bool ask(const base::FileDescriptor& socket, std::string_view question) {
  return send(socket.get(), question.data(), question.size(), MSG_NOSIGNAL) ==
         static_cast<ssize_t>(question.size());
}

bool readUpTo(std::size_t size, const base::FileDescriptor& socket, const base::Deadline& deadline,
              std::string& answer) {
  while (answer.size() < size) {
    if (!base::waitFor(socket.get(), POLLIN, deadline)) return false;
    std::array<char, 16384> part{};
    const ssize_t count = recv(socket.get(), part.data(), std::min(part.size(), size - answer.size()), 0);
    if (count == 0 || (count < 0 && errno != EINTR && errno != EAGAIN)) return false;
    if (count > 0) answer.append(part.data(), static_cast<std::size_t>(count));
  }
  return true;
}

}  // namespace linux::windows::wlr
