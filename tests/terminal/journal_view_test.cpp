#include "platform/terminal/journal_view.h"

#include <clocale>

#include <gtest/gtest.h>

namespace {

using terminal::JournalView;
using Lines = std::vector<std::wstring>;

/// One letter a line; a capital letter is a command.
JournalView viewOf(std::string_view letters) {
  std::setlocale(LC_CTYPE, "C.UTF-8");
  JournalView view;
  for (const char letter : letters) {
    if (letter >= 'A' && letter <= 'Z') {
      view.addCommand(std::string(1, letter));
    } else {
      view.add({stage::Entry::Question, std::string(1, letter), 0, {}, {}});
    }
  }
  return view;
}

Lines shown(const JournalView& view, int rows, int back = 0, bool wholeScripts = false) {
  Lines texts;
  for (const terminal::Line& line : view.show(rows, 20, back, wholeScripts)) texts.push_back(line.text);
  return texts;
}

TEST(JournalView, FoldsWhatFollowsItself) {
  const std::pair<std::string_view, Lines> cases[] = {
      {"ab", {L"  a", L"  b"}},
      {"aaa", {L"  a ×3"}},
      {"abab", {L"  ×2:", L"    a", L"    b"}},
      {"xabababy", {L"  x", L"  ×3:", L"    a", L"    b", L"  y"}},
      {"aabaab", {L"  ×2:", L"    a ×2", L"    b"}},
      {"aabab", {L"  a ×2", L"  b", L"  a", L"  b"}},
      {"TaTa", {L"▸ T", L"  a", L"▸ T", L"  a"}},
      {"TT", {L"▸ T", L"▸ T"}},
  };
  for (const auto& [letters, lines] : cases) EXPECT_EQ(shown(viewOf(letters), 9), lines) << letters;
}

TEST(JournalView, DoesNotGrowWithWhatRepeatsNorWithoutEnd) {
  std::string repeated;
  for (int i = 0; i < 5000; ++i) repeated += "abc";
  EXPECT_EQ(shown(viewOf(repeated), 9), (Lines{L"  ×5000:", L"    a", L"    b", L"    c"}));

  EXPECT_EQ(shown(viewOf(std::string(5000, 'T')), 5000).size(), 2000u);
}

TEST(JournalView, ShowsScriptsInFullOnDemand) {
  JournalView view;
  view.add({stage::Entry::Script, "script to A: b ⏎ c = 1", 0, "tell A\nb\nc\nend", "= 1"});
  EXPECT_EQ(shown(view, 9, 0, true),
            (Lines{L"  script to A:", L"    tell A", L"    b", L"    c", L"    end", L"    = 1"}));
}

}  // namespace
