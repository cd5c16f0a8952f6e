// The applications as rows of text: which run, which is in front, what each does.
#pragma once

#include <string>
#include <vector>

#include "platform/stage/desktop.h"

namespace terminal {

enum class Mark { None, Runs, InFront };

/// What there is to tell of one application.
struct ApplicationRow {
  std::size_t number = 0;  ///< the digit that stands for it; above 9 there is none
  Mark mark = Mark::None;
  std::wstring name;
  /// Behind the name: a position and settings, what it would be good for, or its trouble.
  std::wstring details;
  bool inTrouble = false;
  /// What it does, in lines below the name; none when it does not run.
  std::vector<std::wstring> state;
};

/// Where the parts of a row begin.
inline constexpr int kNumberColumn = 1;
inline constexpr int kMarkColumn = 3;
inline constexpr int kNameColumn = 5;
inline constexpr int kDetailsColumn = 21;

/// All of them in the order of their digits, for a box of so many columns.
std::vector<ApplicationRow> rowsOf(const stage::Desktop& desktop, int columns);

/// How many lines they take.
int linesOf(const std::vector<ApplicationRow>& rows);

/// Takes away what does not fit into so many lines: of states first, which then stand behind the names, last
/// that of the application in front; then the applications that do not run, and in the end others.
void fit(std::vector<ApplicationRow>& rows, int lines);

}  // namespace terminal
