// Folding: what comes again and again is written once, with how often.
#pragma once

#include <cstddef>
#include <ostream>
#include <string>
#include <vector>

#include "platform/stage/clock.h"

namespace stage {

/// Collects lines; a block of lines that follows itself is folded into one as it comes in, so that memory
/// does not grow with the repeats.
class Fold {
 public:
  /// `time` is nanoseconds since some beginning; lines that differ in it alone count as the same.
  void add(std::string text, Nanoseconds time);
  /// Writes everything, indented by two blanks, and starts anew. Lines later than the beginning carry their
  /// time.
  void write(std::ostream& output);
  bool empty() const { return items_.empty(); }

 private:
  /// A line, or a block of items that occurred `count` times.
  struct Item {
    std::string text;
    std::vector<Item> block;
    std::size_t count = 1;
    Nanoseconds first = 0;
    Nanoseconds last = 0;

    bool sameAs(const Item& other) const;
  };

  bool extendBlock(std::size_t length);
  bool beginBlock(std::size_t length);
  static void write(std::ostream& output, const std::vector<Item>& items, std::size_t indent);

  std::vector<Item> items_;
};

/// A length of time for people: "0.05s", "1.05s", "10m", "2h10m".
std::string timeText(Nanoseconds duration);

}  // namespace stage
