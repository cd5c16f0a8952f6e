// Words without regard to case. Case is folded in ASCII only; other letters compare as they are written.
#pragma once

#include <cstdint>
#include <string_view>

namespace text {

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

}  // namespace text
