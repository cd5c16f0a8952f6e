#include "report/arguments.h"

#include <string_view>

namespace report {

Arguments parseArguments(std::span<const char* const> words) {
  Arguments arguments;
  for (const std::string_view word : words) {
    if (word == "--help" || word == "-h") arguments.action = Action::ShowHelp;
    if (word == "--version") arguments.action = Action::ShowVersion;
    if (arguments.action != Action::Report) return arguments;
  }
  for (const std::string_view word : words) {
    if (word == "--json") {
      arguments.json = true;
    } else if (word.starts_with('-')) {
      throw remote::UsageError("unknown option " + remote::inQuotes(word) + " (see kvd-report --help)");
    } else if (arguments.button != nullptr) {
      throw remote::UsageError("one button at a time, without " + remote::inQuotes(word));
    } else {
      arguments.button = &remote::knownButton(word);
    }
  }
  return arguments;
}

}  // namespace report
