#include "platform/text/utf8.h"

#include <algorithm>

namespace text {
namespace {

constexpr char32_t kLastCharacter = 0x10FFFF;

unsigned char byteAt(std::string_view bytes, std::size_t at) { return static_cast<unsigned char>(bytes[at]); }

bool continues(char byte) { return (static_cast<unsigned char>(byte) & 0xC0) == 0x80; }

/// How many bytes a character with this first byte has; 0 when none begins so.
std::size_t lengthOf(unsigned char lead) {
  if (lead < 0x80) return 1;
  if (lead < 0xC0) return 0;
  if (lead < 0xE0) return 2;
  if (lead < 0xF0) return 3;
  return lead < 0xF8 ? 4 : 0;
}

}  // namespace

std::optional<char32_t> takeCharacter(std::string_view& bytes) {
  static constexpr char32_t smallest[] = {0, 0, 0x80, 0x800, 0x10000};
  if (bytes.empty()) return std::nullopt;
  const std::size_t length = lengthOf(byteAt(bytes, 0));
  if (length == 0 || length > bytes.size()) return std::nullopt;
  char32_t character = length == 1 ? byteAt(bytes, 0) : byteAt(bytes, 0) & (0x7Fu >> length);
  for (std::size_t i = 1; i < length; ++i) {
    if (!continues(bytes[i])) return std::nullopt;
    character = character << 6 | (byteAt(bytes, i) & 0x3F);
  }
  const bool surrogate = character >= 0xD800 && character <= 0xDFFF;
  if (character < smallest[length] || character > kLastCharacter || surrogate) return std::nullopt;
  bytes.remove_prefix(length);
  return character;
}

std::size_t findInvalidUTF8(std::string_view bytes) {
  std::string_view rest = bytes;
  while (takeCharacter(rest)) {
  }
  return rest.empty() ? std::string_view::npos : bytes.size() - rest.size();
}

bool isUTF8(std::string_view bytes) { return findInvalidUTF8(bytes) == std::string_view::npos; }

std::size_t characterCount(std::string_view utf8) {
  return utf8.size() - static_cast<std::size_t>(std::ranges::count_if(utf8, continues));
}

std::string_view truncated(std::string_view utf8, std::size_t mostBytes) {
  std::size_t length = std::min(utf8.size(), mostBytes);
  while (length < utf8.size() && length > 0 && continues(utf8[length])) --length;
  return utf8.substr(0, length);
}

void appendUTF8(std::string& utf8, char32_t character) {
  if (character < 0x80) {
    utf8 += static_cast<char>(character);
    return;
  }
  const int more = character < 0x800 ? 1 : character < 0x10000 ? 2 : 3;
  utf8 += static_cast<char>((0xF0 << (3 - more) & 0xFF) | character >> 6 * more);
  for (int i = more - 1; i >= 0; --i) utf8 += static_cast<char>(0x80 | (character >> 6 * i & 0x3F));
}

}  // namespace text
