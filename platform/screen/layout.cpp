#include "platform/screen/layout.h"

#include <algorithm>

#include "platform/screen/remote_keys.h"

namespace live {

namespace {

/// From here on the remote finds room beside the applications.
constexpr int kWide = 80;
/// A journal of fewer rows, its heading among them, tells nobody anything.
constexpr int kJournalRows = 4;

}  // namespace

Layout arrange(int rows, int columns, int applications, int keys) {
  Layout layout;
  const bool wide = columns >= kWide;
  layout.title = {0, 0, 1, columns};
  const int hintRows = wide ? 1 : 2;
  layout.hint = {rows - 1 - hintRows, 0, hintRows, columns};
  layout.footer = {rows - 1, 0, 1, columns};

  const int keyRows = 1 + (keys + kKeysPerRow - 1) / kKeysPerRow;
  int free = rows - 2 - hintRows - kJournalRows;
  const int band = wide ? std::max(1 + applications, keyRows) : 1 + applications;
  layout.applications = {1, 0, std::min(band, free), wide ? columns - kRemoteColumns : columns};
  free -= layout.applications.rows;
  int below = 1 + layout.applications.rows;
  if (wide) {
    layout.remote = {1, columns - kRemoteColumns, layout.applications.rows, kRemoteColumns};
  } else if (free >= keyRows) {
    layout.remote = {below, 0, keyRows, columns};
    below += keyRows;
  }
  layout.journal = {below, 0, layout.hint.top - below, columns};
  return layout;
}

}  // namespace live
