#include "platform/base/file_descriptor.h"

#include <fcntl.h>
#include <unistd.h>

namespace base {

FileDescriptor::~FileDescriptor() {
  if (descriptor_ >= 0) close(descriptor_);
}

Pipe makePipe() {
  int ends[2] = {-1, -1};
  if (pipe2(ends, O_CLOEXEC) != 0) return {FileDescriptor(), FileDescriptor()};
  return {FileDescriptor(ends[0]), FileDescriptor(ends[1])};
}

}  // namespace base
