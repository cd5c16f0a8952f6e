// Lines from a descriptor, one at a time, without missing what goes on elsewhere.
#pragma once

#include <cstddef>
#include <optional>
#include <string>

namespace stage {

class LineReader {
 public:
  explicit LineReader(int descriptor) : descriptor_(descriptor) {}

  /// The next line without its end. Nothing at the end of the input, or as soon as the `other` descriptor
  /// (none when −1) is readable while no line is there yet. A line that is too long to be a command comes in
  /// pieces.
  std::optional<std::string> next(int other);
  bool atEnd() const { return ended_ && buffer_.empty(); }

 private:
  static constexpr std::size_t kLongestLine = 65'536;

  std::optional<std::string> takeLine();

  int descriptor_;
  std::string buffer_;
  bool ended_ = false;
};

}  // namespace stage
