// From the bottom up: putting text into a box, the parts from top to bottom, the whole.

#include "platform/screen/paint.h"

#include <curses.h>

#include <algorithm>
#include <string>
#include <utility>
#include <vector>

#include "daemon/kvd.h"
#include "platform/screen/catalogue.h"
#include "platform/screen/help.h"
#include "platform/screen/layout.h"
#include "platform/screen/text.h"

namespace live {

namespace {

using stage::Application;
using stage::Desktop;

enum Color : short { Green = 1, Cyan, Yellow, Red, Magenta };

attr_t colored(Color color) { return static_cast<attr_t>(COLOR_PAIR(color)); }

attr_t attributesOf(Tone tone) {
  switch (tone) {
    case Tone::Command:
      return A_BOLD;
    case Tone::Answer:
      return A_NORMAL;
    case Tone::Error:
      return colored(Red);
    case Tone::Question:
      return A_DIM;
    case Tone::Action:
      return colored(Cyan);
    case Tone::Change:
      return colored(Green);
    case Tone::Service:
      return colored(Magenta);
  }
  return A_NORMAL;
}

// ---- Text into boxes ----

/// Writes into one row of a box what fits from a column of it on. Returns the column behind.
int put(const Box& box, int row, int column, std::wstring_view text, attr_t attributes = A_NORMAL) {
  if (row >= box.rows || column >= box.columns) return column;
  const std::wstring shown = clip(text, box.columns - column);
  attr_set(attributes & ~static_cast<attr_t>(A_COLOR),
           static_cast<short>(PAIR_NUMBER(static_cast<int>(attributes))), nullptr);
  mvaddnwstr(box.top + row, box.left + column, shown.c_str(), static_cast<int>(shown.size()));
  attr_set(A_NORMAL, 0, nullptr);
  return column + width(shown);
}

/// The first row of a part: its name in a rule.
void putHeading(const Box& box, std::wstring_view name) {
  const int end = put(box, 0, 0, L"── " + std::wstring(name) + L" ", A_BOLD);
  put(box, 0, end, std::wstring(static_cast<std::size_t>(std::max(0, box.columns - end)), L'─'), A_DIM);
}

// ---- The parts ----

void paintTitle(const Box& box, const Desktop& desktop) {
  constexpr int kBarWidth = 10;
  const int filled = (desktop.outputVolume * kBarWidth + 50) / 100;
  const std::wstring bar = std::wstring(static_cast<std::size_t>(filled), L'█') +
                           std::wstring(static_cast<std::size_t>(kBarWidth - filled), L'░');
  const std::wstring volume = L"volume " + bar + L" " + std::to_wstring(desktop.outputVolume) +
                              (desktop.outputMuted ? L" muted" : L"");
  const int volumeColumn = box.columns - width(volume) - 1;

  Box left = box;
  left.columns = volumeColumn - 1;
  int column = put(left, 0, 1, L"kvd", A_BOLD);
  if (gScreenLocked) column = put(left, 0, column + 1, L"screen locked", colored(Red) | A_BOLD);
  put(left, 0, column + 1, L"on the rehearsal desktop");
  put(box, 0, volumeColumn, volume, desktop.outputMuted ? colored(Red) : colored(Yellow));
}

struct Row {
  const Application* application;
  std::size_t number;
};

/// In the order of their digits; those that run first where there is no room for all.
std::vector<Row> rowsOf(const Desktop& desktop, std::size_t room) {
  std::vector<Row> rows;
  for (const Application* const application : openable(desktop))
    rows.push_back({application, rows.size() + 1});
  if (rows.size() <= room) return rows;
  std::stable_partition(rows.begin(), rows.end(), [](const Row& row) { return row.application->running(); });
  return rows;
}

/// What it does, or what it would be good for.
std::wstring stateOf(const Application& application) {
  if (!application.running()) return widen(roleOf(application));
  const std::string doing = application.describe();
  std::wstring state = doing.empty() ? L"runs" : widen(doing);
  if (application.instances.size() > 1)
    state += L" (×" + std::to_wstring(application.instances.size()) + L")";
  return state;
}

void paintApplication(const Box& box, int line, const Row& row, const Desktop& desktop) {
  constexpr int kNameColumn = 5;
  constexpr int kStateColumn = 21;
  const Application& application = *row.application;
  const bool inFront = desktop.front && desktop.front->application == &application;
  const bool running = application.running();
  if (row.number <= 9) put(box, line, 1, std::to_wstring(row.number), colored(Yellow));
  if (running) put(box, line, 3, inFront ? L"»" : L"●", colored(Green));
  Box names = box;
  names.columns = std::min(box.columns, kStateColumn - 1);
  put(names, line, kNameColumn, widen(application.name), running ? A_BOLD : A_NORMAL);
  put(box, line, kStateColumn, stateOf(application), running ? A_NORMAL : A_DIM);
}

void paintApplications(const Box& box, const Desktop& desktop) {
  putHeading(box, L"Applications: ● runs, » in front");
  const auto room = static_cast<std::size_t>(box.rows - 1);
  const std::vector<Row> rows = rowsOf(desktop, room);
  const std::size_t shown = rows.size() <= room ? rows.size() : room - 1;
  for (std::size_t i = 0; i < shown; ++i) paintApplication(box, static_cast<int>(i) + 1, rows[i], desktop);
  if (shown == rows.size()) return;
  put(box, box.rows - 1, 3, L"… and " + std::to_wstring(rows.size() - shown) + L" more", A_DIM);
}

void paintRemote(const Box& box, const RemoteKey* held) {
  putHeading(box, L"Remote");
  constexpr int kLabelColumns = 6;
  constexpr int kCellColumns = 17;
  int cell = 0;
  for (const RemoteKey& key : remoteKeys()) {
    const int row = 1 + cell / kKeysPerRow;
    const int column = cell % kKeysPerRow * kCellColumns;
    put(box, row, column, key.label, colored(Yellow));
    put(box, row, column + kLabelColumns, std::wstring(key.what) + (&key == held ? L"…" : L""),
        &key == held ? A_REVERSE : A_NORMAL);
    ++cell;
  }
}

void paintJournal(const Box& box, State& state) {
  Box rows = box;
  ++rows.top;
  --rows.rows;
  const std::vector<Line> lines = state.journal.show(rows.rows, rows.columns - 1, state.scrolled);
  state.page = rows.rows - 1;
  putHeading(box, state.scrolled > 0 ? L"What kvd asks and does (Page Down for the newest)"
                                     : L"What kvd asks and does");
  const int first = rows.rows - static_cast<int>(lines.size());
  for (std::size_t i = 0; i < lines.size(); ++i) {
    put(rows, first + static_cast<int>(i), 1, lines[i].text, attributesOf(lines[i].tone));
  }
}

void paintHint(const Box& box, const State& state, const Desktop& desktop) {
  std::wstring hint = widen(state.lessons.hint(desktop));
  if (state.held != nullptr) {
    hint = L"You hold " + std::wstring(state.held->what) + L". Press " + std::wstring(state.held->label) +
           L" to let it go.";
  }
  int row = 0;
  for (const std::wstring& line : wrap(hint, box.columns - 2, 0))
    put(box, row++, 1, line, colored(Yellow) | A_BOLD);
}

/// What else the keyboard does, or what is being typed, with the cursor behind it.
void paintFooter(const Box& box, const State& state) {
  constexpr std::wstring_view kKeys =
      L" 1-9 open/front  x close  0 front nobody  l lock  : command  ? help  q quit";
  constexpr std::wstring_view kFewerKeys = L" 1-9 open  : command  ? help  q quit";
  curs_set(state.commandLine ? 1 : 0);
  if (state.commandLine) {
    std::wstring_view typed = *state.commandLine;
    while (width(typed) > box.columns - 3) typed.remove_prefix(1);
    const int end = put(box, 0, 0, L" :" + std::wstring(typed));
    move(box.top, std::min(end, box.columns - 1));
  } else if (state.closing) {
    put(box, 0, 0, L" Close which one? Press its digit.", A_BOLD);
  } else {
    put(box, 0, 0, width(kKeys) <= box.columns ? kKeys : kFewerKeys, A_DIM);
  }
}

struct HelpLine {
  std::wstring_view key;
  std::wstring text;
  int column;
};

std::vector<HelpLine> layOutHelp(int columns) {
  std::vector<HelpLine> lines;
  for (const HelpRow& row : helpRows()) {
    const int column = row.key.empty() ? 0 : kHelpKeyColumns;
    std::wstring_view key = row.key;
    for (std::wstring& text : wrap(row.text, columns - column, 0)) {
      lines.push_back({std::exchange(key, {}), std::move(text), column});
    }
  }
  return lines;
}

void paintHelp(const Box& box, State& state) {
  const std::vector<HelpLine> lines = layOutHelp(box.columns - 2);
  state.page = box.rows - 1;
  state.scrolled = std::clamp(state.scrolled, 0, std::max(0, static_cast<int>(lines.size()) - box.rows));
  int row = 0;
  for (auto line = lines.begin() + state.scrolled; line != lines.end() && row < box.rows; ++line, ++row) {
    put(box, row, 1, line->key, colored(Yellow));
    put(box, row, 1 + line->column, line->text);
  }
}

void paintTooSmall(const Box& box) {
  curs_set(0);
  int row = 0;
  for (const std::wstring& line :
       wrap(L"This window is too small: kvd-stage needs " + std::to_wstring(kFewestColumns) +
                L" columns and " + std::to_wstring(kFewestRows) + L" rows.",
            box.columns, 0)) {
    put(box, row++, 0, line);
  }
}

}  // namespace

void preparePaint() {
  if (has_colors() == FALSE) return;
  start_color();
  use_default_colors();
  init_pair(Green, COLOR_GREEN, -1);
  init_pair(Cyan, COLOR_CYAN, -1);
  init_pair(Yellow, COLOR_YELLOW, -1);
  init_pair(Red, COLOR_RED, -1);
  init_pair(Magenta, COLOR_MAGENTA, -1);
}

void paint(State& state, const Desktop& desktop) {
  int rows = 0;
  int columns = 0;
  getmaxyx(stdscr, rows, columns);
  erase();
  if (rows < kFewestRows || columns < kFewestColumns) {
    paintTooSmall({0, 0, rows, columns});
    refresh();
    return;
  }
  const Layout layout = arrange(rows, columns, static_cast<int>(openable(desktop).size()),
                                static_cast<int>(remoteKeys().size()));
  paintTitle(layout.title, desktop);
  if (state.showsHelp) {
    paintHelp({1, 0, layout.hint.top - 1, columns}, state);
  } else {
    paintApplications(layout.applications, desktop);
    paintRemote(layout.remote, state.held);
    paintJournal(layout.journal, state);
  }
  paintHint(layout.hint, state, desktop);
  paintFooter(layout.footer, state);
  refresh();
}

}  // namespace live
