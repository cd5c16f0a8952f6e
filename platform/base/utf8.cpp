#include "platform/base/utf8.h"

#include <cstddef>

namespace base {
namespace {

constexpr char32_t kLastCharacter = 0x10FFFF;

/// How many bytes a sequence with this first byte has; 0 when none begins so.
std::size_t sequenceLength(unsigned char lead) {
  if (lead < 0x80) return 1;
  if (lead < 0xC0) return 0;
  if (lead < 0xE0) return 2;
  if (lead < 0xF0) return 3;
  return lead < 0xF8 ? 4 : 0;
}

}  // namespace

bool isUTF8(std::string_view bytes) {
  static constexpr char32_t smallest[] = {0, 0, 0x80, 0x800, 0x10000};
  while (!bytes.empty()) {
    const auto lead = static_cast<unsigned char>(bytes[0]);
    const std::size_t length = sequenceLength(lead);
    if (length == 0 || length > bytes.size()) return false;
    char32_t character = length == 1 ? lead : lead & (0x7Fu >> length);
    for (std::size_t i = 1; i < length; ++i) {
      const auto next = static_cast<unsigned char>(bytes[i]);
      if ((next & 0xC0) != 0x80) return false;
      character = character << 6 | (next & 0x3F);
    }
    const bool surrogate = character >= 0xD800 && character <= 0xDFFF;
    if (character < smallest[length] || character > kLastCharacter || surrogate) return false;
    bytes.remove_prefix(length);
  }
  return true;
}

void appendUTF8(std::string& text, char32_t character) {
  if (character < 0x80) {
    text += static_cast<char>(character);
    return;
  }
  const int more = character < 0x800 ? 1 : character < 0x10000 ? 2 : 3;
  text += static_cast<char>((0xF0 << (3 - more) & 0xFF) | character >> 6 * more);
  for (int i = more - 1; i >= 0; --i) text += static_cast<char>(0x80 | (character >> 6 * i & 0x3F));
}

}  // namespace base
