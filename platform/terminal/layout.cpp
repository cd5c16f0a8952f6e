#include "platform/terminal/layout.h"

#include <algorithm>

#include "platform/terminal/keys.h"

namespace terminal {

namespace {

/// From here on there is room for two parts beside each other.
constexpr int kWide = 80;
/// The left of them: the keys just fit into the narrowest, a wider one than the widest stays empty.
constexpr int kNarrowestLeft = 44;
constexpr int kWidestLeft = 60;
/// A journal of fewer rows, its heading among them, tells nobody anything.
constexpr int kJournalRows = 4;

int rowsFor(std::size_t keys) { return 1 + (static_cast<int>(keys) + kKeysPerRow - 1) / kKeysPerRow; }

bool isWide(int columns) { return columns >= kWide; }

}  // namespace

int applicationColumns(int columns) {
  return isWide(columns) ? std::clamp(columns * 2 / 5, kNarrowestLeft, kWidestLeft) : columns;
}

Layout arrange(int rows, int columns, int applicationLines) {
  const bool wide = isWide(columns);
  const int hintRows = wide ? 1 : 2;
  Layout layout;
  layout.title = {0, 0, 1, columns};
  layout.target = {1, 0, 1, columns};
  layout.hint = {rows - 1 - hintRows, 0, hintRows, columns};
  layout.footer = {rows - 1, 0, 1, columns};

  constexpr int kBodyTop = 2;
  const int body = layout.hint.top - kBodyTop;
  const int left = applicationColumns(columns);
  const int remoteRows = rowsFor(remoteKeys().size());
  const int otherRows = rowsFor(otherKeys().size());
  int free = wide ? body : body - kJournalRows;

  const bool showsRemote = free >= remoteRows + std::min(1 + applicationLines, body / 3);
  layout.applications = {kBodyTop, 0, std::min(1 + applicationLines, free - (showsRemote ? remoteRows : 0)),
                         left};
  free -= layout.applications.rows;
  int below = kBodyTop + layout.applications.rows;
  const auto take = [&](Box& box, int taken) {
    box = {below, 0, taken, left};
    below += taken;
    free -= taken;
  };
  if (showsRemote) take(layout.remote, remoteRows);
  if (showsRemote && wide && free >= otherRows) take(layout.otherKeys, otherRows);
  layout.journal = wide ? Box{kBodyTop, left + 1, body, columns - left - 1}
                        : Box{below, 0, layout.hint.top - below, columns};
  return layout;
}

}  // namespace terminal
