#include "platform/terminal/application_rows.h"

#include <algorithm>
#include <numeric>

#include "platform/stage/quantities.h"
#include "platform/terminal/catalogue.h"
#include "platform/terminal/text.h"

namespace terminal {

namespace {

using stage::Application;
using stage::Desktop;

/// A state of more lines is cut.
constexpr std::size_t kStateLines = 2;

/// What keeps it from doing as it is told; empty when nothing does.
std::string troubleOf(const Application& application) {
  if (application.hangsUntil > stage::now()) {
    const auto left = (application.hangsUntil - stage::now() + stage::kSecond - 1) / stage::kSecond;
    return "hangs for " + stage::timeText(left * stage::kSecond);
  }
  switch (application.manner) {
    case stage::Manner::Obeys:
      return {};
    case stage::Manner::Refuses:
      return "answers errors";
    case stage::Manner::Ignores:
      return "answers nothing";
  }
  return {};
}

bool hasDisplay(const Desktop& desktop, const Application& application) {
  return std::ranges::any_of(desktop.displays, [&](const stage::Display& display) {
    return std::ranges::find(display.holders, &application) != display.holders.end();
  });
}

std::string stateOf(const Desktop& desktop, const Application& application) {
  std::string state = application.describe();
  if (state.empty()) state = "runs";
  if (hasDisplay(desktop, application)) state += ", has the display";
  if (application.instances.size() > 1) state += " (×" + std::to_string(application.instances.size()) + ")";
  return state;
}

ApplicationRow rowOf(const Desktop& desktop, const Application& application, int columns) {
  ApplicationRow row;
  row.name = widen(application.name);
  const std::string trouble = troubleOf(application);
  row.inTrouble = !trouble.empty();
  if (!application.running()) {
    row.details = widen(row.inTrouble ? trouble : std::string(roleOf(application)));
    return row;
  }
  const bool inFront = desktop.front && desktop.front->application == &application;
  row.mark = inFront ? Mark::InFront : Mark::Runs;
  row.details = widen(row.inTrouble ? trouble : application.details());
  row.state = wrap(widen(stateOf(desktop, application)), columns - kNameColumn, 0);
  if (row.state.size() > kStateLines) row.state.resize(kStateLines);
  return row;
}

}  // namespace

std::vector<ApplicationRow> rowsOf(const Desktop& desktop, int columns) {
  std::vector<ApplicationRow> rows;
  for (const Application* const application : openable(desktop)) {
    rows.push_back(rowOf(desktop, *application, columns));
    rows.back().number = rows.size();
  }
  return rows;
}

int linesOf(const std::vector<ApplicationRow>& rows) {
  return std::accumulate(rows.begin(), rows.end(), 0, [](int lines, const ApplicationRow& row) {
    return lines + 1 + static_cast<int>(row.state.size());
  });
}

void fit(std::vector<ApplicationRow>& rows, int lines) {
  const auto shorten = [&](auto&& shortenRow, bool inFront) {
    for (auto row = rows.rbegin(); row != rows.rend() && linesOf(rows) > lines; ++row) {
      if (!row->state.empty() && (row->mark == Mark::InFront) == inFront) shortenRow(*row);
    }
  };
  const auto toOneLine = [](ApplicationRow& row) { row.state.resize(1); };
  const auto behindTheName = [](ApplicationRow& row) {
    if (!row.inTrouble) row.details = row.state.front();
    row.state.clear();
  };
  for (const bool inFront : {false, true}) shorten(toOneLine, inFront);
  for (const bool inFront : {false, true}) shorten(behindTheName, inFront);
  if (linesOf(rows) <= lines) return;
  std::stable_partition(rows.begin(), rows.end(),
                        [](const ApplicationRow& row) { return row.mark != Mark::None; });
  rows.resize(static_cast<std::size_t>(std::max(lines, 0)));
}

}  // namespace terminal
