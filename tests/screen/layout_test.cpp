#include "platform/screen/layout.h"

#include <gtest/gtest.h>

#include <vector>

namespace {

using live::Box;

/// True when the boxes that are shown cover each cell of the screen at most once, and none beside it.
bool fit(const std::vector<Box>& boxes, int rows, int columns) {
  std::vector<std::vector<int>> uses(static_cast<std::size_t>(rows),
                                     std::vector<int>(static_cast<std::size_t>(columns)));
  for (const Box& box : boxes) {
    if (box.rows == 0) continue;
    if (box.top < 0 || box.left < 0 || box.top + box.rows > rows || box.left + box.columns > columns)
      return false;
    for (int row = box.top; row < box.top + box.rows; ++row) {
      for (int column = box.left; column < box.left + box.columns; ++column) {
        if (++uses[static_cast<std::size_t>(row)][static_cast<std::size_t>(column)] > 1) return false;
      }
    }
  }
  return true;
}

TEST(Layout, FitsEveryTerminalFromTheSmallestOn) {
  for (int rows = live::kFewestRows; rows < 50; ++rows) {
    for (int columns = live::kFewestColumns; columns < 120; columns += 3) {
      for (const int applications : {1, 7, 40}) {
        const live::Layout layout = live::arrange(rows, columns, applications, 14);
        EXPECT_TRUE(fit(
            {layout.title, layout.applications, layout.remote, layout.journal, layout.hint, layout.footer},
            rows, columns))
            << rows << "x" << columns << ", " << applications;
        EXPECT_GE(layout.applications.rows, 2);
        EXPECT_GE(layout.journal.rows, 4);
      }
    }
  }
}

TEST(Layout, ShowsTheWholeRemoteOnAnUsualTerminal) {
  for (const auto& [rows, columns] : {std::pair(24, 80), std::pair(24, 132), std::pair(30, 60)}) {
    const live::Layout layout = live::arrange(rows, columns, 7, 14);
    EXPECT_EQ(layout.remote.rows, 8);
    EXPECT_EQ(layout.applications.rows, 8);
  }
}

}  // namespace
