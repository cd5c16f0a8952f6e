#include "platform/terminal/journal_view.h"

#include <algorithm>
#include <utility>

#include "platform/terminal/text.h"

namespace terminal {

namespace {

/// Older items are forgotten; more than anybody scrolls back through.
constexpr std::size_t kMostItems = 2000;

constexpr int kIndent = 2;

Tone toneOf(stage::Entry kind) {
  switch (kind) {
    case stage::Entry::Question:
      return Tone::Question;
    case stage::Entry::Script:
    case stage::Entry::Event:
    case stage::Entry::Key:
    case stage::Entry::SoundKey:
      return Tone::Action;
    case stage::Entry::Change:
      return Tone::Change;
    case stage::Entry::Remark:
      return Tone::Answer;
    case stage::Entry::Error:
    case stage::Entry::Failure:
      return Tone::Error;
    case stage::Entry::Notification:
    case stage::Entry::Timer:
    case stage::Entry::Service:
    case stage::Entry::Exit:
      return Tone::Service;
  }
  return Tone::Service;
}

std::wstring times(std::size_t count) { return L"×" + std::to_wstring(count); }

void appendLine(std::vector<Line>& lines, Tone tone, const std::wstring& text, int columns, int indent) {
  const std::wstring margin(static_cast<std::size_t>(indent), L' ');
  for (const std::wstring& part : wrap(margin + text, columns, indent + kIndent)) {
    lines.push_back({tone, part});
  }
}

std::vector<std::wstring> linesOf(const std::string& source) {
  std::vector<std::wstring> lines;
  for (std::size_t begin = 0; begin < source.size();) {
    const std::size_t end = std::min(source.find('\n', begin), source.size());
    lines.push_back(widen(source.substr(begin, end - begin)));
    begin = end + 1;
  }
  return lines;
}

}  // namespace

void JournalView::add(const stage::JournalLine& line) {
  push({{toneOf(line.kind), widen(line.text)}, linesOf(line.source), widen(line.outcome)});
}

void JournalView::addCommand(const std::string& command) {
  push({{Tone::Command, L"▸ " + widen(command)}, {}, {}});
}

void JournalView::push(Row row) {
  if (items_.size() == kMostItems) items_.pop_front();
  stage::addFolding(items_, std::move(row),
                    [](const Item& item) { return isOneRow(item) && item.thing.line.tone != Tone::Command; });
}

void JournalView::append(std::vector<Line>& lines, const Item& item, int columns, int indent,
                         bool wholeScripts) {
  const std::wstring count = item.count > 1 ? L" " + times(item.count) : std::wstring();
  const auto& [line, source, outcome] = item.thing;
  const auto& [tone, text] = line;
  if (!wholeScripts || source.empty()) return appendLine(lines, tone, text + count, columns, indent);
  appendLine(lines, tone, text.substr(0, text.find(L':') + 1) + count, columns, indent);
  for (const std::wstring& part : source) appendLine(lines, tone, part, columns, indent + kIndent);
  if (!outcome.empty()) appendLine(lines, Tone::Answer, outcome, columns, indent + kIndent);
}

std::vector<Line> JournalView::render(const Item& item, int columns, bool wholeScripts) {
  std::vector<Line> lines;
  const int indent = item.thing.line.tone == Tone::Command ? 0 : kIndent;
  if (isOneRow(item)) {
    append(lines, item, columns, indent, wholeScripts);
    return lines;
  }
  appendLine(lines, Tone::Answer, times(item.count) + L":", columns, indent);
  for (const Item& row : item.block) append(lines, row, columns, indent + kIndent, wholeScripts);
  return lines;
}

std::vector<Line> JournalView::show(int rows, int columns, int& back, bool wholeScripts) const {
  const auto wanted = static_cast<std::size_t>(rows + std::max(back, 0));
  std::vector<Line> upwards;
  for (auto item = items_.rbegin(); item != items_.rend() && upwards.size() < wanted; ++item) {
    const std::vector<Line> lines = render(*item, columns, wholeScripts);
    upwards.insert(upwards.end(), lines.rbegin(), lines.rend());
  }
  back = std::clamp(back, 0, std::max(0, static_cast<int>(upwards.size()) - rows));
  const auto newest = upwards.begin() + back;
  const auto count = std::min<std::ptrdiff_t>(rows, upwards.end() - newest);
  std::vector<Line> shown(newest, newest + count);
  std::reverse(shown.begin(), shown.end());
  return shown;
}

}  // namespace terminal
