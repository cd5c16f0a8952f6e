#include "platform/base/file_descriptor.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>

namespace base {

FileDescriptor::~FileDescriptor() {
  if (descriptor_ >= 0) close(descriptor_);
}

Pipe makePipe() {
  int ends[2] = {-1, -1};
  if (pipe2(ends, O_CLOEXEC) != 0) return {FileDescriptor(), FileDescriptor()};
  return {FileDescriptor(ends[0]), FileDescriptor(ends[1])};
}

bool writeAll(const FileDescriptor& file, std::string_view bytes) {
  while (!bytes.empty()) {
    const ssize_t count = write(file.get(), bytes.data(), bytes.size());
    if (count < 0 && errno != EINTR) return false;
    if (count > 0) bytes.remove_prefix(static_cast<std::size_t>(count));
  }
  return true;
}

}  // namespace base
