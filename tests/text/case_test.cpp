#include "platform/text/case.h"

#include <gtest/gtest.h>

#include <tuple>

namespace {

TEST(Case, IsFoldedInASCIIAlone) {
  const std::tuple<std::string_view, std::string_view, int> cases[] = {
      {"Play", "pLAY", 0}, {"", "", 0},   {"play", "Pause", 1}, {"Z", "[", 1}, {"a", "[", 1},
      {"A", "ab", -1},     {"", "a", -1}, {"ä", "Ä", 1},        {"é", "z", 1}, {"@", "`", -1},
  };
  for (const auto& [a, b, order] : cases) {
    const int result = text::compareIgnoringCase(a, b);
    EXPECT_EQ((result > 0) - (result < 0), order) << a << " and " << b;
    EXPECT_EQ(text::equalIgnoringCase(a, b), order == 0) << a << " and " << b;
    EXPECT_EQ(text::foldedHash(a) == text::foldedHash(b), order == 0) << a << " and " << b;
  }
}

}  // namespace
