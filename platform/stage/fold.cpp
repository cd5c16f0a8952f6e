#include "platform/stage/fold.h"

#include <algorithm>
#include <cstdio>
#include <utility>

namespace stage {

namespace {

/// The longest block that is looked for: more than one button makes on the desktop.
constexpr std::size_t kLongestBlock = 24;

}  // namespace

bool Fold::Item::sameAs(const Item& other) const {
  return count == other.count && text == other.text &&
         std::equal(block.begin(), block.end(), other.block.begin(), other.block.end(),
                    [](const Item& a, const Item& b) { return a.sameAs(b); });
}

/// The last `length` items repeat the block before them: count them there.
bool Fold::extendBlock(std::size_t length) {
  if (items_.size() < length + 1) return false;
  const auto tail = items_.end() - static_cast<std::ptrdiff_t>(length);
  Item& block = *(tail - 1);
  if (block.block.size() != length || !std::equal(tail, items_.end(), block.block.begin(),
                                                  [](const Item& a, const Item& b) { return a.sameAs(b); })) {
    return false;
  }
  ++block.count;
  block.last = tail->last;
  items_.erase(tail, items_.end());
  return true;
}

/// The last `length` items repeat as many before them: make the two a block.
bool Fold::beginBlock(std::size_t length) {
  if (items_.size() < 2 * length) return false;
  const auto second = items_.end() - static_cast<std::ptrdiff_t>(length);
  const auto first = second - static_cast<std::ptrdiff_t>(length);
  if (!std::equal(second, items_.end(), first, [](const Item& a, const Item& b) { return a.sameAs(b); }))
    return false;
  Item block;
  block.count = 2;
  block.first = first->first;
  block.last = second->last;
  block.block.assign(std::make_move_iterator(first), std::make_move_iterator(second));
  items_.erase(first, items_.end());
  items_.push_back(std::move(block));
  return true;
}

void Fold::add(std::string text, Nanoseconds time) {
  Item item;
  item.text = std::move(text);
  item.first = item.last = time;
  items_.push_back(std::move(item));
  for (std::size_t length = 1; length <= kLongestBlock; ++length) {
    if (extendBlock(length) || beginBlock(length)) return;
  }
}

void Fold::write(std::ostream& output, const std::vector<Item>& items, std::size_t indent) {
  for (const Item& item : items) {
    output << std::string(indent, ' ');
    const bool lasts = item.last > item.first;
    if (item.first > 0 || lasts)
      output << '+' << timeText(item.first) << (lasts ? " to +" + timeText(item.last) : "") << "  ";
    if (item.block.empty()) {
      output << item.text << '\n';
    } else if (item.block.size() == 1 && item.block.front().block.empty()) {
      output << item.block.front().text << " ×" << item.count << '\n';
    } else {
      output << "×" << item.count << ":\n";
      std::vector<Item> block = item.block;
      for (Item& inner : block) inner.first = inner.last = 0;
      write(output, block, indent + 2);
    }
  }
}

void Fold::write(std::ostream& output) {
  write(output, items_, 2);
  items_.clear();
}

std::string timeText(Nanoseconds duration) {
  const Nanoseconds hours = duration / (3600 * kSecond);
  const Nanoseconds minutes = duration / (60 * kSecond) % 60;
  const double seconds = static_cast<double>(duration % (60 * kSecond)) / static_cast<double>(kSecond);
  std::string text;
  if (hours > 0) text += std::to_string(hours) + "h";
  if (minutes > 0) text += std::to_string(minutes) + "m";
  if (seconds > 0 || text.empty()) {
    char digits[32];
    std::snprintf(digits, sizeof digits, "%.10gs", seconds);
    text += digits;
  }
  return text;
}

}  // namespace stage
