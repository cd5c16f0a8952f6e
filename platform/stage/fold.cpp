#include "platform/stage/fold.h"

#include <utility>

#include "platform/stage/quantities.h"

namespace stage {

namespace {

constexpr std::size_t kIndent = 2;

}  // namespace

void Fold::add(std::string text, Nanoseconds time) {
  addFolding(items_, Line{std::move(text), time}, [](const Item&) { return true; });
}

Nanoseconds Fold::firstTime(const Item& item) {
  return item.block.empty() ? item.thing.time : firstTime(item.block.front());
}

void Fold::writeTimes(std::ostream& output, const Item& item) {
  const Nanoseconds first = firstTime(item);
  const Nanoseconds last = item.thing.time;
  const bool lasts = last > first;
  if (first > 0 || lasts) output << '+' << timeText(first) << (lasts ? " to +" + timeText(last) : "") << "  ";
}

void Fold::writeContent(std::ostream& output, const Item& item, std::size_t indent) {
  if (item.block.empty()) {
    output << item.thing.text << '\n';
  } else if (item.block.size() == 1 && item.block.front().block.empty()) {
    output << item.thing.text << " ×" << item.count << '\n';
  } else {
    output << "×" << item.count << ":\n";
    for (const Item& inner : item.block) {
      output << std::string(indent + kIndent, ' ');
      writeContent(output, inner, indent + kIndent);
    }
  }
}

void Fold::write(std::ostream& output) {
  for (const Item& item : items_) {
    output << std::string(kIndent, ' ');
    writeTimes(output, item);
    writeContent(output, item, kIndent);
  }
  items_.clear();
}

}  // namespace stage
