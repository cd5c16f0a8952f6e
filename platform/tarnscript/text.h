// Text helpers: case, UTF-8 and numbers as text. Case is folded in ASCII only; other letters compare as they
// are written.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace tarnscript {

constexpr char foldCase(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }

/// A hash that is the same for words that differ in case only (FNV-1a).
constexpr std::uint32_t foldedHash(std::string_view word) {
  std::uint32_t hash = 2166136261U;
  for (const char c : word) hash = (hash ^ static_cast<unsigned char>(foldCase(c))) * 16777619U;
  return hash;
}

bool equalIgnoringCase(std::string_view a, std::string_view b);
/// Negative, zero or positive as `a` sorts before, with or after `b`.
int compareIgnoringCase(std::string_view a, std::string_view b);

/// The offset of the first byte that is not valid UTF-8; npos when all of it is.
std::size_t findInvalidUTF8(std::string_view text);
/// Characters (code points) of a valid UTF-8 text.
std::size_t characterCount(std::string_view text);

std::string toText(std::int64_t number);
/// The shortest text that reads back as this number, with a point so that it stays a real ("1.0").
std::string toText(double number);

}  // namespace tarnscript
