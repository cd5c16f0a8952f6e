// kvd-receiver's command line.
#pragma once

#include <span>
#include <string>
#include <vector>

namespace receiver {

enum class Action { Run, Monitor, List, ShowHelp, ShowVersion };

struct Arguments {
  Action action = Action::Run;
  /// Devices that are remotes whatever they look like, by path or name.
  std::vector<std::string> devices;
  bool grab = true;
  /// Where the helper listens that hands keys on to the desktop.
  std::string passThrough;
};

/// Reads a command line, without the program's name. Throws remote::UsageError.
Arguments parseArguments(std::span<const char* const> words);

}  // namespace receiver
