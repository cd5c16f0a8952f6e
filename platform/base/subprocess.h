// Other programs, run to their end for what they say.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "platform/base/deadline.h"

namespace base {

/// A program and what it is started with.
struct Subprocess {
  /// The program's file; it is not searched for.
  std::string path;
  /// Its arguments, the first of them its own name.
  std::vector<std::string> arguments = {};
  /// All that there is to read on its standard input.
  std::string input = {};
  /// Its standard error is thrown away; else it is this process's.
  bool discardsErrors = false;
};

/// What a program left.
struct SubprocessResult {
  /// Its exit status, 0 to 255; nothing where it did not end by itself.
  std::optional<int> status;
  /// Its standard output, up to its end or to where it was killed.
  std::string output;
};

/// Starts the program, with no signal blocked or ignored that endLoopOnSignals() blocks or ignores, and waits
/// until it has ended. One that has written more than `mostOutput` bytes, or has not ended at the deadline,
/// is killed. Nothing when it cannot be started.
std::optional<SubprocessResult> runToEnd(Subprocess program, std::size_t mostOutput,
                                         const Deadline& deadline);

}  // namespace base
