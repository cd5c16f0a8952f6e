#include "platform/property_list/base64.h"

#include <cstdint>

namespace property_list {

std::optional<std::string> decodeBase64(std::string_view text) {
  static constexpr std::string_view digits =
      "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
  static constexpr std::string_view blanks = " \t\r\n";
  std::string bytes;
  std::uint32_t group = 0;
  int characters = 0;
  int padding = 0;
  for (const char c : text) {
    if (blanks.find(c) != std::string_view::npos) continue;
    const auto digit = digits.find(c);
    if (c == '=' ? ++padding > 2 : padding > 0 || digit == std::string_view::npos) return std::nullopt;
    group = group << 6 | (c == '=' ? 0 : static_cast<std::uint32_t>(digit));
    if (++characters % 4 != 0) continue;
    for (int shift = 16; shift >= 8 * padding; shift -= 8) bytes += static_cast<char>(group >> shift & 0xFF);
  }
  if (characters % 4 != 0) return std::nullopt;
  return bytes;
}

}  // namespace property_list
