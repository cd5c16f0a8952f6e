// Repeats: what comes again and again is kept once, with how often, so that memory does not grow with it.
#pragma once

#include <algorithm>
#include <cstddef>
#include <deque>
#include <iterator>
#include <utility>
#include <vector>

namespace stage {

/// A thing, or a block of such items that came `count` times one after the other.
template <typename Thing>
struct Folded {
  /// Of a block the first thing of its latest time.
  Thing thing;
  /// What the block consists of, as it first came; empty for a thing.
  std::vector<Folded> block = {};
  std::size_t count = 1;

  bool operator==(const Folded& other) const {
    return count == other.count && thing == other.thing &&
           std::equal(block.begin(), block.end(), other.block.begin(), other.block.end());
  }
};

/// The longest block that is looked for: more than one button makes on the desktop.
inline constexpr std::size_t kLongestBlock = 24;

/// The last `length` items repeat the block before them: counts them there.
template <typename Thing>
bool extendBlock(std::deque<Folded<Thing>>& items, std::size_t length) {
  if (items.size() < length + 1) return false;
  const auto tail = items.end() - static_cast<std::ptrdiff_t>(length);
  Folded<Thing>& block = *(tail - 1);
  if (!std::equal(tail, items.end(), block.block.begin(), block.block.end())) return false;
  ++block.count;
  block.thing = std::move(tail->thing);
  items.erase(tail, items.end());
  return true;
}

/// The last `length` items repeat as many before them: makes the two a block.
template <typename Thing>
bool beginBlock(std::deque<Folded<Thing>>& items, std::size_t length) {
  if (items.size() < 2 * length) return false;
  const auto second = items.end() - static_cast<std::ptrdiff_t>(length);
  const auto first = second - static_cast<std::ptrdiff_t>(length);
  if (!std::equal(first, second, second)) return false;
  Folded<Thing> block{.thing = std::move(second->thing), .count = 2};
  block.block.assign(std::make_move_iterator(first), std::make_move_iterator(second));
  items.erase(first, items.end());
  items.push_back(std::move(block));
  return true;
}

/// Adds a thing, and folds what then repeats itself at the end of the items. Items that `mayRepeat` denies
/// are not folded, and nothing across them.
template <typename Thing, typename MayRepeat>
void addFolding(std::deque<Folded<Thing>>& items, Thing thing, MayRepeat mayRepeat) {
  items.push_back({.thing = std::move(thing)});
  for (std::size_t length = 1; length <= std::min(kLongestBlock, items.size()); ++length) {
    if (!mayRepeat(items[items.size() - length])) return;
    if (extendBlock(items, length) || beginBlock(items, length)) return;
  }
}

}  // namespace stage
