#include "platform/terminal/text.h"

#include <clocale>

#include <gtest/gtest.h>

namespace {

class Text : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NE(std::setlocale(LC_CTYPE, "C.UTF-8"), nullptr); }
};

TEST_F(Text, ShowsNothingThatMovesTheCursor) {
  const std::pair<std::string_view, std::wstring_view> cases[] = {
      {"“Pas” → ×3 ⏎", L"“Pas” → ×3 ⏎"}, {"\xF0\x9F\x8E\xB5", L"🎵"},
      {"a\x1B[2J\tb\x7F", L"a [2J b "},  {"\xC2\x9B", L" "},
      {"caf\xE9", L"caf\uFFFD"},         {"\xED\xA0\x80", L"\uFFFD\uFFFD\uFFFD"},
  };
  for (const auto& [utf8, wide] : cases) EXPECT_EQ(terminal::widen(utf8), wide) << utf8;
}

TEST_F(Text, IsCutByColumns) {
  const std::tuple<std::wstring_view, int, std::wstring_view> cases[] = {
      {L"plays", 5, L"plays"}, {L"plays", 4, L"pla…"}, {L"日本語", 6, L"日本語"}, {L"日本語", 5, L"日本…"},
      {L"日本語", 4, L"日…"},  {L"plays", 1, L"…"},    {L"plays", 0, L""},
  };
  for (const auto& [text, columns, shown] : cases) {
    EXPECT_EQ(terminal::clip(text, columns), shown) << columns;
    EXPECT_LE(terminal::width(terminal::clip(text, columns)), columns);
  }
}

}  // namespace
