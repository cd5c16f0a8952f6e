// Lines of text, those that repeat written once with how often.
#pragma once

#include <cstddef>
#include <deque>
#include <ostream>
#include <string>

#include "platform/stage/clock.h"
#include "platform/stage/repeats.h"

namespace stage {

/// Collects lines, and folds them as they come in.
class Fold {
 public:
  /// `time` is nanoseconds since some beginning; lines that differ in it alone count as the same.
  void add(std::string text, Nanoseconds time);
  /// Writes everything, indented by two blanks, and starts anew. Lines later than the beginning carry their
  /// time.
  void write(std::ostream& output);
  bool empty() const { return items_.empty(); }

 private:
  struct Line {
    std::string text;
    Nanoseconds time;
    bool operator==(const Line& other) const { return text == other.text; }
  };
  using Item = Folded<Line>;

  static Nanoseconds firstTime(const Item& item);
  static void writeTimes(std::ostream& output, const Item& item);
  static void writeContent(std::ostream& output, const Item& item, std::size_t indent);

  std::deque<Item> items_;
};

}  // namespace stage
