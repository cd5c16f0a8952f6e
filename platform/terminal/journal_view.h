// What the journal's part of the screen shows: lines in the order in which they came, repeats folded.
#pragma once

#include <deque>
#include <string>
#include <vector>

#include "platform/stage/journal.h"
#include "platform/stage/repeats.h"

namespace terminal {

/// What a line is, for its colour.
enum class Tone {
  Command,   ///< what the person did
  Answer,    ///< what a command answered
  Error,     ///< what went wrong
  Question,  ///< what the daemon asked
  Action,    ///< what it sent: a script, an event, a key
  Change,    ///< what came of it
  Service,   ///< its dealings with the system
};

struct Line {
  Tone tone;
  std::wstring text;
  bool operator==(const Line&) const = default;
};

class JournalView {
 public:
  void add(const stage::JournalLine& line);
  /// What the person did. Nothing is folded across it.
  void addCommand(const std::string& command);

  /// At most `rows` rows of the view at a width, top to bottom, the newest last; without the last `back`
  /// rows. `back` is held so that the view stays full as long as there is enough to show. With `wholeScripts`
  /// every script is there as it was sent, line by line, and not in short.
  std::vector<Line> show(int rows, int columns, int& back, bool wholeScripts) const;

 private:
  struct Row {
    Line line;
    /// Of a script: its lines, and what it answered.
    std::vector<std::wstring> source;
    std::wstring outcome;
    bool operator==(const Row&) const = default;
  };
  using Item = stage::Folded<Row>;

  void push(Row row);
  static bool isOneRow(const Item& item) { return item.block.size() <= 1; }
  static void append(std::vector<Line>& lines, const Item& item, int columns, int indent, bool wholeScripts);
  static std::vector<Line> render(const Item& item, int columns, bool wholeScripts);

  std::deque<Item> items_;
};

}  // namespace terminal
