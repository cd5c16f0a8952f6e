#include "platform/terminal/layout.h"

#include <gtest/gtest.h>

#include <vector>

namespace {

using terminal::Box;

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
  for (int rows = terminal::kFewestRows; rows < 50; ++rows) {
    for (int columns = terminal::kFewestColumns; columns < 120; columns += 3) {
      for (const int lines : {1, 14, 80}) {
        const terminal::Layout layout = terminal::arrange(rows, columns, lines);
        EXPECT_TRUE(fit({layout.title, layout.target, layout.applications, layout.remote, layout.otherKeys,
                         layout.journal, layout.hint, layout.footer},
                        rows, columns))
            << rows << "x" << columns << ", " << lines;
        EXPECT_GE(layout.applications.rows, 2);
        EXPECT_GE(layout.journal.rows, 4);
      }
    }
  }
}

TEST(Layout, ShowsTheWholeRemoteAndTheJournalAtTheSide) {
  for (const auto& [rows, columns] : {std::pair(24, 80), std::pair(30, 100), std::pair(45, 140)}) {
    const terminal::Layout layout = terminal::arrange(rows, columns, 14);
    EXPECT_EQ(layout.remote.rows, 6);
    EXPECT_GE(layout.applications.rows, 14);
    EXPECT_EQ(layout.journal.top, layout.applications.top);
    EXPECT_EQ(layout.otherKeys.rows, rows > 24 ? 5 : 0);
  }
}

}  // namespace
