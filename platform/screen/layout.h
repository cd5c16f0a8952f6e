// Where the parts of the screen go.
#pragma once

namespace live {

/// The smallest terminal on which everything has its place.
inline constexpr int kFewestRows = 12;
inline constexpr int kFewestColumns = 40;

/// A rectangle of character cells, the top left cell of the screen being 0, 0. One without rows is not shown.
struct Box {
  int top = 0;
  int left = 0;
  int rows = 0;
  int columns = 0;
};

/// The parts. Applications, remote and journal have a heading in their first row.
struct Layout {
  Box title;
  Box applications;
  Box remote;
  Box journal;
  Box hint;
  Box footer;
};

/// Lays out a terminal that is not too small. The remote's keys stand beside the applications; a narrow
/// terminal has them below, if it is high enough.
Layout arrange(int rows, int columns, int applications, int keys);

}  // namespace live
