// The little of sockets that both ends of a port need.
#pragma once

#include <sys/un.h>

#include <utility>

namespace base {

/// A descriptor that is closed when it goes; none when negative.
class FileDescriptor {
 public:
  explicit FileDescriptor(int descriptor = -1) : descriptor_(descriptor) {}
  FileDescriptor(FileDescriptor&& other) noexcept : descriptor_(std::exchange(other.descriptor_, -1)) {}
  FileDescriptor& operator=(FileDescriptor&& other) noexcept {
    std::swap(descriptor_, other.descriptor_);
    return *this;
  }
  ~FileDescriptor();

  int get() const { return descriptor_; }
  explicit operator bool() const { return descriptor_ >= 0; }

 private:
  int descriptor_;
};

/// A datagram socket, non-blocking and closed on exec; none when there are no descriptors left.
FileDescriptor datagramSocket();

/// A datagram socket connected to an address; none, with errno set, when nobody is there.
FileDescriptor connectedSocket(const sockaddr_un& address);

}  // namespace base
