// From top to bottom, the parts; then the whole.

#include "platform/terminal/paint.h"

#include <curses.h>

#include <algorithm>
#include <string>
#include <utility>
#include <vector>

#include "daemon/kvd.h"
#include "platform/terminal/application_rows.h"
#include "platform/terminal/brush.h"
#include "platform/terminal/help.h"
#include "platform/terminal/keys.h"
#include "platform/terminal/layout.h"
#include "platform/terminal/text.h"

namespace terminal {

namespace {

using stage::Desktop;

attr_t attributesOf(Tone tone) {
  switch (tone) {
    case Tone::Command:
      return A_BOLD;
    case Tone::Answer:
      return A_NORMAL;
    case Tone::Error:
      return colored(Color::Red, A_BOLD);
    case Tone::Question:
      return A_DIM;
    case Tone::Action:
      return colored(Color::Cyan);
    case Tone::Change:
      return colored(Color::Green, A_BOLD);
    case Tone::Service:
      return colored(Color::Magenta, A_DIM);
  }
  return A_NORMAL;
}

// ---- Title ----

std::wstring volumeText(const Desktop& desktop) {
  constexpr int kBarWidth = 20;
  const auto filled = static_cast<std::size_t>((desktop.outputVolume * kBarWidth + 50) / 100);
  const std::wstring bar = std::wstring(filled, L'█') + std::wstring(kBarWidth - filled, L'░');
  return L"volume " + bar + L" " + std::to_wstring(desktop.outputVolume) +
         (desktop.outputMuted ? L" muted" : L"");
}

void paintTitle(const Box& box, const Desktop& desktop) {
  const std::wstring volume = volumeText(desktop);
  const int volumeColumn = std::max(0, box.columns - width(volume) - 1);
  Box left = box;
  left.columns = volumeColumn - 1;
  int column = put(left, 0, 1, L"kvd", A_BOLD) + 1;
  const bool captured = std::ranges::any_of(desktop.displays, &stage::Display::captured);
  if (gScreenLocked) column = put(left, 0, column, L"screen locked", colored(Color::Red) | A_BOLD) + 1;
  if (captured) column = put(left, 0, column, L"display captured", colored(Color::Cyan) | A_BOLD) + 1;
  if (!gScreenLocked && !captured) put(left, 0, column, L"on the rehearsal desktop");
  put(box, 0, volumeColumn, volume, colored(desktop.outputMuted ? Color::Red : Color::Yellow));
}

void paintTarget(const Box& box, const LastTarget& target) {
  const int column = put(box, 0, 1, L"last button → ");
  put(box, 0, column, target.text(), A_BOLD);
}

// ---- Applications ----

/// Returns the line behind the application's.
int paintApplication(const Box& box, int line, const ApplicationRow& row) {
  constexpr std::size_t kLastDigit = 9;
  const bool runs = row.mark != Mark::None;
  if (row.number <= kLastDigit)
    put(box, line, kNumberColumn, std::to_wstring(row.number), colored(Color::Yellow));
  if (runs)
    put(box, line, kMarkColumn, row.mark == Mark::InFront ? L"»" : L"●", colored(Color::Green, A_BOLD));
  Box names = box;
  names.columns = std::min(box.columns, kDetailsColumn - 1);
  put(names, line, kNameColumn, row.name, runs ? A_BOLD : A_NORMAL);
  put(box, line++, kDetailsColumn, row.details,
      row.inTrouble ? colored(Color::Red, A_BOLD)
      : runs        ? A_NORMAL
                    : A_DIM);
  for (const std::wstring& state : row.state) put(box, line++, kNameColumn, state, colored(Color::Green));
  return line;
}

void paintApplications(const Box& box, std::vector<ApplicationRow> rows) {
  putHeading(box, L"Applications: ● runs, » in front");
  const std::size_t all = rows.size();
  fit(rows, box.rows - 1);
  if (rows.size() < all && !rows.empty()) rows.pop_back();
  int line = 1;
  for (const ApplicationRow& row : rows) line = paintApplication(box, line, row);
  if (rows.size() < all)
    put(box, line, kMarkColumn, L"… and " + std::to_wstring(all - rows.size()) + L" more", A_DIM);
}

// ---- Keys ----

/// The columns of a key in its row, of the remote and of the others: where it begins, and what it does.
struct KeyColumns {
  int label;
  int what;
};
constexpr KeyColumns kRemoteColumns[kKeysPerRow] = {{1, 7}, {14, 20}, {32, 36}};
constexpr KeyColumns kOtherColumns[kKeysPerRow] = {{1, 6}, {17, 19}, {33, 35}};

void paintRemote(const Box& box, const RemoteKey* held) {
  putHeading(box, L"Remote");
  int cell = 0;
  for (const RemoteKey& key : remoteKeys()) {
    const int row = 1 + cell / kKeysPerRow;
    const auto& [label, what] = kRemoteColumns[cell++ % kKeysPerRow];
    put(box, row, label, key.label, colored(Color::Yellow, A_BOLD));
    put(box, row, what, key.what, &key == held ? A_REVERSE : A_NORMAL);
  }
}

void paintOtherKeys(const Box& box) {
  putHeading(box, L"Desktop");
  int cell = 0;
  for (const OtherKey& key : otherKeys()) {
    const int row = 1 + cell / kKeysPerRow;
    const auto& [label, what] = kOtherColumns[cell++ % kKeysPerRow];
    put(box, row, label, key.label, colored(Color::Yellow, A_BOLD));
    put(box, row, what, key.what);
  }
}

// ---- Journal ----

void paintJournal(const Box& box, State& state) {
  Box rows = box;
  ++rows.top;
  --rows.rows;
  const std::vector<Line> lines =
      state.journal.show(rows.rows, rows.columns - 1, state.scrolled, state.wholeScripts);
  state.page = rows.rows - 1;
  putHeading(box, state.scrolled > 0   ? L"Journal: PgDn for the newest"
                  : state.wholeScripts ? L"Journal, scripts in full"
                                       : L"What kvd asks and does");
  const int first = rows.rows - static_cast<int>(lines.size());
  for (std::size_t i = 0; i < lines.size(); ++i) {
    put(rows, first + static_cast<int>(i), 1, lines[i].text, attributesOf(lines[i].tone));
  }
}

// ---- The last lines ----

void paintHint(const Box& box, const State& state, const Desktop& desktop) {
  std::wstring hint = widen(state.lessons.hint(desktop));
  if (state.showsHelp) {
    hint = L"Any other key leaves this page.";
  } else if (desktop.waitedFor != nullptr) {
    hint =
        L"kvd waits for " + widen(desktop.waitedFor->name) + L" to answer. Keys wait with it; Ctrl-C quits.";
  } else if (state.held != nullptr) {
    hint = L"You hold " + std::wstring(state.held->what) + L". Press " + std::wstring(state.held->label) +
           L" again to let it go.";
  }
  int row = 0;
  for (const std::wstring& line : wrap(hint, box.columns - 2, 0))
    put(box, row++, 1, line, colored(Color::Yellow) | A_BOLD);
}

/// What else the keyboard does, as much as there is room for.
std::wstring_view footerFor(int columns) {
  constexpr std::wstring_view kFooters[] = {
      L" 1-9 open/front  x close  e fail  0 no front  l lock  c capture  v version  s scripts  : command  "
      L"? all keys  q quit",
      L" 1-9 open/front  x close  l lock  s scripts  : command  ? all keys  q quit",
      L" 1-9 open  : command  ? keys  q quit",
  };
  const auto* const footer =
      std::ranges::find_if(kFooters, [&](std::wstring_view text) { return width(text) <= columns; });
  return footer != std::end(kFooters) ? *footer : kFooters[std::size(kFooters) - 1];
}

/// The keys, or what is being typed, with the cursor behind it.
void paintFooter(const Box& box, const State& state) {
  curs_set(state.commandLine ? 1 : 0);
  if (state.commandLine) {
    std::wstring_view typed = *state.commandLine;
    while (width(typed) > box.columns - 3) typed.remove_prefix(1);
    const int end = put(box, 0, 0, L" :" + std::wstring(typed));
    move(box.top, std::min(end, box.columns - 1));
    return;
  }
  switch (state.pending) {
    case Pending::Nothing:
      put(box, 0, 0, footerFor(box.columns), A_DIM);
      break;
    case Pending::Close:
      put(box, 0, 0, L" Close which one? Press its digit.", A_BOLD);
      break;
    case Pending::Fail:
      put(box, 0, 0, L" Make which one fail, or obey again? Press its digit.", A_BOLD);
      break;
  }
}

// ---- Other pages ----

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
    put(box, row, 1, line->key, colored(Color::Yellow, A_BOLD));
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

void paintDesktop(int rows, int columns, State& state, const Desktop& desktop) {
  std::vector<ApplicationRow> applications = rowsOf(desktop, applicationColumns(columns));
  // Two lines for each, whether it runs or not: what stands below does not jump.
  const int lines = std::max(linesOf(applications), 2 * static_cast<int>(applications.size()));
  const Layout layout = arrange(rows, columns, lines);
  paintTitle(layout.title, desktop);
  paintTarget(layout.target, state.target);
  if (state.showsHelp) {
    paintHelp({layout.applications.top, 0, layout.hint.top - layout.applications.top, columns}, state);
  } else {
    paintApplications(layout.applications, std::move(applications));
    paintRemote(layout.remote, state.held);
    paintOtherKeys(layout.otherKeys);
    paintJournal(layout.journal, state);
  }
  paintHint(layout.hint, state, desktop);
  paintFooter(layout.footer, state);
}

}  // namespace

void paint(State& state, const Desktop& desktop) {
  int rows = 0;
  int columns = 0;
  getmaxyx(stdscr, rows, columns);
  erase();
  if (rows < kFewestRows || columns < kFewestColumns) {
    paintTooSmall({0, 0, rows, columns});
  } else {
    paintDesktop(rows, columns, state, desktop);
  }
  refresh();
}

}  // namespace terminal
