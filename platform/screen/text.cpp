#include "platform/screen/text.h"

#include <wchar.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>

#include "platform/base/utf8.h"

namespace live {

namespace {

constexpr wchar_t kReplacement = L'\uFFFD';
constexpr wchar_t kEllipsis = L'…';

int width(wchar_t character) { return wcwidth(character); }

/// The character whose first byte is at `at`, which moves behind it; the text must be UTF-8.
wchar_t decode(std::string_view text, std::size_t& at) {
  const auto lead = static_cast<unsigned char>(text[at++]);
  if (lead < 0x80) return static_cast<wchar_t>(lead);
  const int following = lead < 0xE0 ? 1 : lead < 0xF0 ? 2 : 3;
  std::uint32_t code = lead & (0x3Fu >> following);
  for (int i = 0; i < following; ++i) code = code << 6 | (static_cast<unsigned char>(text[at++]) & 0x3Fu);
  return static_cast<wchar_t>(code);
}

/// How many characters, at least one, fit into so many columns.
std::size_t fitting(std::wstring_view text, int columns) {
  std::size_t count = 0;
  for (int used = 0; count < text.size(); ++count) {
    used += width(text[count]);
    if (used > columns && count > 0) break;
  }
  return count;
}

}  // namespace

std::wstring widen(std::string_view utf8) {
  std::wstring wide;
  if (!base::isUTF8(utf8)) {
    for (const char byte : utf8)
      wide += byte >= ' ' && byte <= '~' ? static_cast<wchar_t>(byte) : kReplacement;
    return wide;
  }
  for (std::size_t at = 0; at < utf8.size();) {
    const wchar_t character = decode(utf8, at);
    const bool isControl = character < L' ' || (character >= 0x7F && character < 0xA0);
    // What the locale cannot show would upset the count of columns.
    wide += isControl ? L' ' : width(character) < 0 ? kReplacement : character;
  }
  return wide;
}

int width(std::wstring_view text) {
  int columns = 0;
  for (const wchar_t character : text) columns += width(character);
  return columns;
}

std::wstring clip(std::wstring_view text, int columns) {
  if (width(text) <= columns) return std::wstring(text);
  if (columns < 2) return std::wstring(static_cast<std::size_t>(std::max(columns, 0)), kEllipsis);
  return std::wstring(text.substr(0, fitting(text, columns - 1))) + kEllipsis;
}

std::vector<std::wstring> wrap(std::wstring_view text, int columns, int indent) {
  std::vector<std::wstring> lines;
  std::wstring margin;
  do {
    const int room = columns - static_cast<int>(margin.size());
    std::size_t count = fitting(text, room);
    std::size_t next = count;
    if (count < text.size()) {
      const std::size_t blank = text.rfind(L' ', count);
      if (blank != std::wstring_view::npos && blank > 0) {
        count = blank;
        next = blank + 1;
      }
    }
    lines.push_back(margin + std::wstring(text.substr(0, count)));
    text.remove_prefix(next);
    margin.assign(static_cast<std::size_t>(std::clamp(indent, 0, columns / 2)), L' ');
  } while (!text.empty());
  return lines;
}

}  // namespace live
