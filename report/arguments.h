// What kvd-report's command line asks for.
#pragma once

#include <span>

#include "remote/buttons.h"
#include "remote/words.h"

namespace report {

enum class Action { ShowHelp, ShowVersion, Report };

struct Arguments {
  Action action = Action::Report;
  /// The button to rehearse; null for what there is.
  const remote::Button* button = nullptr;
  bool json = false;
};

/// Reads a command line, without the program's name. Throws remote::UsageError.
Arguments parseArguments(std::span<const char* const> words);

}  // namespace report
