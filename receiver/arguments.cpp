#include "receiver/arguments.h"

#include <optional>
#include <string_view>

#include "receiver/pass_through/protocol.h"
#include "remote/words.h"

namespace receiver {
namespace {

using remote::UsageError;

/// The value of an option, in the same word behind = or in the next one, which is then passed over; nothing
/// where the word is not that option.
std::optional<std::string> valueOf(std::string_view option, std::span<const char* const> words,
                                   std::size_t& index) {
  const std::string_view word = words[index];
  if (!word.starts_with(option)) return std::nullopt;
  const std::string_view rest = word.substr(option.size());
  if (rest.starts_with('=')) return std::string(rest.substr(1));
  if (!rest.empty()) return std::nullopt;
  if (index + 1 == words.size()) throw UsageError(std::string(option) + " needs a value");
  return words[++index];
}

void setAction(Arguments& arguments, Action action) {
  if (arguments.action != Action::Run && arguments.action != action) {
    throw UsageError("only one of --list and --monitor");
  }
  arguments.action = action;
}

}  // namespace

Arguments parseArguments(std::span<const char* const> words) {
  Arguments arguments;
  arguments.passThrough = pass_through::kSocket;
  for (const std::string_view word : words) {
    if (word == "--help" || word == "-h") arguments.action = Action::ShowHelp;
    if (word == "--version") arguments.action = Action::ShowVersion;
    if (arguments.action != Action::Run) return arguments;
  }
  for (std::size_t index = 0; index < words.size(); ++index) {
    const std::string_view word = words[index];
    if (word == "--list") {
      setAction(arguments, Action::List);
    } else if (word == "--monitor") {
      setAction(arguments, Action::Monitor);
    } else if (word == "--no-grab") {
      arguments.grab = false;
    } else if (const auto device = valueOf("--device", words, index)) {
      if (device->empty())
        throw UsageError("--device needs a path such as /dev/input/event5, or a device's name");
      arguments.devices.push_back(*device);
    } else if (const auto socket = valueOf("--pass-through", words, index)) {
      arguments.passThrough = *socket;
    } else {
      throw UsageError("unknown argument " + remote::inQuotes(word) + " (kvd-receiver --help lists them)");
    }
  }
  return arguments;
}

}  // namespace receiver
