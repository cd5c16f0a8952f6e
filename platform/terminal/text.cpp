#include "platform/terminal/text.h"

#include <wchar.h>

#include <algorithm>
#include <cstddef>

#include "platform/text/utf8.h"

namespace terminal {

namespace {

constexpr wchar_t kReplacement = L'\uFFFD';
constexpr wchar_t kEllipsis = L'…';

int width(wchar_t character) { return wcwidth(character); }

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
  if (!text::isUTF8(utf8)) {
    for (const char byte : utf8)
      wide += byte >= ' ' && byte <= '~' ? static_cast<wchar_t>(byte) : kReplacement;
    return wide;
  }
  while (const auto taken = text::takeCharacter(utf8)) {
    const auto character = static_cast<wchar_t>(*taken);
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

}  // namespace terminal
