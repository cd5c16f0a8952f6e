#include "platform/text/utf8.h"

#include <gtest/gtest.h>

#include <utility>

namespace {

constexpr std::size_t kNone = std::string_view::npos;

TEST(UTF8, TheFirstInvalidByteIsFound) {
  const std::pair<std::string_view, std::size_t> cases[] = {
      {"", kNone},
      {"a€b", kNone},
      {{"\0a", 2}, kNone},
      {"ab\x80", 2},
      {"€\xC0\x80", 3},  // a byte too many for the character
      {"\xE0\x80\x80", 0},
      {"\xF0\x8F\xBF\xBF", 0},
      {"\xED\xA0\x80", 0},
      {"\xF4\x90\x80\x80", 0},  // a surrogate, beyond Unicode
      {"a\xE2\x82", 1},
      {"a\xE2\x82z", 1},  // cut short
      {"\xF8\x88\x80\x80\x80", 0},
  };
  for (const auto& [bytes, offset] : cases) EXPECT_EQ(text::findInvalidUTF8(bytes), offset) << bytes;
}

TEST(UTF8, WhatIsAppendedIsTakenAgain) {
  const char32_t characters[] = {0, 'a', 0x7F, 0x80, 0x7FF, 0x800, 0xD7FF, 0xE000, 0xFFFF, 0x10000, 0x10FFFF};
  std::string written;
  for (const char32_t character : characters) text::appendUTF8(written, character);
  EXPECT_EQ(text::characterCount(written), std::size(characters));
  std::string_view rest = written;
  for (const char32_t character : characters) EXPECT_EQ(text::takeCharacter(rest), character);
  EXPECT_TRUE(rest.empty());
  EXPECT_FALSE(text::takeCharacter(rest));
}

TEST(UTF8, NoCharacterIsCut) {
  const std::pair<std::size_t, std::string_view> cases[] = {
      {0, ""}, {1, "a"}, {2, "a"}, {3, "a"}, {4, "a€"}, {5, "a€b"}, {99, "a€b"},
  };
  for (const auto& [most, left] : cases) EXPECT_EQ(text::truncated("a€b", most), left) << most;
}

}  // namespace
