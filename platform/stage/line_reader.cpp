#include "platform/stage/line_reader.h"

#include <poll.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>

namespace stage {

std::optional<std::string> LineReader::takeLine() {
  const std::size_t end = buffer_.find('\n');
  if (end != std::string::npos) {
    std::string line = buffer_.substr(0, end);
    buffer_.erase(0, end + 1);
    return line;
  }
  if (buffer_.empty() || (!ended_ && buffer_.size() < kLongestLine)) return std::nullopt;
  std::string rest;
  rest.swap(buffer_);
  return rest;
}

std::optional<std::string> LineReader::next(int other) {
  for (;;) {
    if (auto line = takeLine()) return line;
    if (ended_) return std::nullopt;
    pollfd descriptors[] = {{descriptor_, POLLIN, 0}, {other, POLLIN, 0}};
    if (poll(descriptors, 2, -1) < 0) {
      if (errno == EINTR) continue;
      ended_ = true;
      continue;
    }
    if (descriptors[1].revents != 0) return std::nullopt;
    char bytes[4096];
    const ssize_t count = read(descriptor_, bytes, sizeof bytes);
    if (count > 0) {
      buffer_.append(bytes, static_cast<std::size_t>(count));
    } else if (count == 0 || (errno != EINTR && errno != EAGAIN)) {
      ended_ = true;
    }
  }
}

}  // namespace stage
