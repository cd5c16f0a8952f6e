// Descriptors with an owner.
#pragma once

#include <string_view>
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

/// Both ends of a pipe.
struct Pipe {
  FileDescriptor reading;
  FileDescriptor writing;
};

/// A pipe, closed on exec; without ends when there are no descriptors left.
Pipe makePipe();

/// Writes all of it, waiting where it must. False, with errno set, when that fails.
bool writeAll(const FileDescriptor& file, std::string_view bytes);

}  // namespace base
