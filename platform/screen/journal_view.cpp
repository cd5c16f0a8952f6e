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

void append(std::vector<Line>& lines, const Line& line, int columns, int indent) {
  const std::wstring margin(static_cast<std::size_t>(indent), L' ');
  for (const std::wstring& text : wrap(margin + line.text, columns, indent + kIndent)) {
    lines.push_back({line.tone, text});
  }
}

}  // namespace

void JournalView::add(const stage::JournalLine& line) { push({toneOf(line.kind), widen(line.text)}); }

void JournalView::addCommand(const std::string& command) { push({Tone::Command, L"▸ " + widen(command)}); }

void JournalView::push(Line line) {
  blocks_.push_back({{{std::move(line), 1}}, 1});
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

std::vector<Line> JournalView::render(const Block& block, int columns) {
  std::vector<Line> lines;
  int indent = block.rows[0].line.tone == Tone::Command ? 0 : kIndent;
  if (block.count > 1) {
    append(lines, {Tone::Answer, times(block.count) + L":"}, columns, indent);
    indent += kIndent;
  }
  for (const Row& row : block.rows) {
    const std::wstring count = row.count > 1 ? L" " + times(row.count) : std::wstring();
    append(lines, {row.line.tone, row.line.text + count}, columns, indent);
  }
  return lines;
}

std::vector<Line> JournalView::show(int rows, int columns, int& back) const {
  const auto wanted = static_cast<std::size_t>(rows + std::max(back, 0));
  std::vector<Line> upwards;
  for (auto block = blocks_.rbegin(); block != blocks_.rend() && upwards.size() < wanted; ++block) {
    const std::vector<Line> lines = render(*block, columns);
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
