#include "platform/screen/journal_view.h"

#include <algorithm>
#include <utility>

#include "platform/screen/text.h"

namespace live {

namespace {

/// The longest run of rows whose repeats are looked for: more than a repeated button makes.
constexpr std::size_t kLongestBlock = 24;
/// Older blocks are forgotten; more than anybody scrolls back through.
constexpr std::size_t kMostBlocks = 2000;

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
  blocks_.push_back({{std::move(row)}, 1});
  if (blocks_.size() > kMostBlocks) blocks_.pop_front();
  bool folded = foldRow();
  for (std::size_t length = 2; !folded && length <= kLongestBlock; ++length) {
    folded = foldIntoBlock(length) || foldIntoNewBlock(length);
  }
}

/// Whether there is a block so far from the end, the last being 1, and it is a single row that may be folded.
bool JournalView::isRow(std::size_t fromEnd) const {
  if (fromEnd > blocks_.size()) return false;
  return (blocks_.end() - static_cast<std::ptrdiff_t>(fromEnd))->rows.size() == 1 &&
         row(fromEnd).line.tone != Tone::Command;
}

/// The last row repeats the one before it.
bool JournalView::foldRow() {
  if (!isRow(1) || !isRow(2) || row(1).line != row(2).line) return false;
  blocks_.pop_back();
  ++blocks_.back().rows[0].count;
  return true;
}

/// The last `length` rows repeat the block before them.
bool JournalView::foldIntoBlock(std::size_t length) {
  if (blocks_.size() < length + 1) return false;
  Block& block = *(blocks_.end() - static_cast<std::ptrdiff_t>(length + 1));
  if (block.rows.size() != length) return false;
  for (std::size_t i = 0; i < length; ++i) {
    if (!isRow(length - i) || row(length - i) != block.rows[i]) return false;
  }
  ++block.count;
  blocks_.erase(blocks_.end() - static_cast<std::ptrdiff_t>(length), blocks_.end());
  return true;
}

/// The last `length` rows repeat as many before them.
bool JournalView::foldIntoNewBlock(std::size_t length) {
  for (std::size_t i = 1; i <= length; ++i) {
    if (!isRow(i) || !isRow(i + length) || row(i) != row(i + length)) return false;
  }
  Block block;
  block.count = 2;
  for (std::size_t i = length; i >= 1; --i) block.rows.push_back(row(i));
  blocks_.erase(blocks_.end() - static_cast<std::ptrdiff_t>(2 * length), blocks_.end());
  blocks_.push_back(std::move(block));
  return true;
}

void JournalView::append(std::vector<Line>& lines, const Row& row, int columns, int indent,
                         bool wholeScripts) {
  const std::wstring count = row.count > 1 ? L" " + times(row.count) : std::wstring();
  const auto& [tone, text] = row.line;
  if (!wholeScripts || row.source.empty()) return appendLine(lines, tone, text + count, columns, indent);
  appendLine(lines, tone, text.substr(0, text.find(L':') + 1) + count, columns, indent);
  for (const std::wstring& part : row.source) appendLine(lines, tone, part, columns, indent + kIndent);
  if (!row.outcome.empty()) appendLine(lines, Tone::Answer, row.outcome, columns, indent + kIndent);
}

std::vector<Line> JournalView::render(const Block& block, int columns, bool wholeScripts) {
  std::vector<Line> lines;
  int indent = block.rows[0].line.tone == Tone::Command ? 0 : kIndent;
  if (block.count > 1) {
    appendLine(lines, Tone::Answer, times(block.count) + L":", columns, indent);
    indent += kIndent;
  }
  for (const Row& row : block.rows) append(lines, row, columns, indent, wholeScripts);
  return lines;
}

std::vector<Line> JournalView::show(int rows, int columns, int& back, bool wholeScripts) const {
  const auto wanted = static_cast<std::size_t>(rows + std::max(back, 0));
  std::vector<Line> upwards;
  for (auto block = blocks_.rbegin(); block != blocks_.rend() && upwards.size() < wanted; ++block) {
    const std::vector<Line> lines = render(*block, columns, wholeScripts);
    upwards.insert(upwards.end(), lines.rbegin(), lines.rend());
  }
  back = std::clamp(back, 0, std::max(0, static_cast<int>(upwards.size()) - rows));
  const auto newest = upwards.begin() + back;
  const auto count = std::min<std::ptrdiff_t>(rows, upwards.end() - newest);
  std::vector<Line> shown(newest, newest + count);
  std::reverse(shown.begin(), shown.end());
  return shown;
}

}  // namespace live
