// Four-character codes as people read them.
#pragma once

#include <cstdint>
#include <string>

namespace stage {

/// The code's four characters; a dot for one that cannot be printed.
inline std::string fourCharacters(std::uint32_t code) {
  std::string text;
  for (int shift = 24; shift >= 0; shift -= 8) {
    const char c = static_cast<char>(code >> shift & 0xFF);
    text += c >= ' ' && c <= '~' ? c : '.';
  }
  return text;
}

/// The same in single quotes.
inline std::string quoted(std::uint32_t code) { return std::string(1, '\'') + fourCharacters(code) + '\''; }

}  // namespace stage
