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

/// What a program that ended by itself left.
struct SubprocessResult {
  /// Its exit status, 0 to 255.
  int status = 0;
  /// All of its standard output.
  std::string output;
};

/// Starts the program, with no signal blocked or ignored that endLoopOnSignals() blocks or ignores, and waits
/// until it has ended. Nothing when it cannot be started, is ended by a signal, writes more than `mostOutput`
/// bytes or has not ended at the deadline; in the last two cases it is killed.
std::optional<SubprocessResult> runToEnd(Subprocess program, std::size_t mostOutput,
                                         const Deadline& deadline);

}  // namespace base
