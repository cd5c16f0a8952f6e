// Where the parts of the screen go.
#pragma once

namespace terminal {

/// The smallest terminal on which everything that matters has its place.
inline constexpr int kFewestRows = 12;
inline constexpr int kFewestColumns = 40;

/// A rectangle of character cells, the top left cell of the screen being 0, 0. One without rows is not shown.
struct Box {
  int top = 0;
  int left = 0;
  int rows = 0;
  int columns = 0;
};

/// The parts. Applications, remote, other keys and journal have a heading in their first row.
struct Layout {
  Box title;
  Box target;
  Box applications;
  Box remote;
  Box otherKeys;
  Box journal;
  Box hint;
  Box footer;
};

/// How many columns the applications have on a terminal of so many.
int applicationColumns(int columns);

/// Lays out a terminal that is not too small, for applications that take so many lines. From 80 columns on
/// the journal stands at the side; on a narrower terminal it stands below. What there is no room for is left
/// out: the other keys first, then the remote, then applications.
Layout arrange(int rows, int columns, int applicationLines);

}  // namespace terminal
