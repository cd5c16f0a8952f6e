#include "remote/arguments.h"

#include <optional>
#include <string>
#include <string_view>

#include "remote/buttons.h"
#include "remote/words.h"

namespace remote {
namespace {

using Words = std::vector<std::string_view>;

enum class Gesture { Tap, Press, Release, Hold, Raw };

// A command line taken apart: what begins with a hyphen, and the words that are left.
struct Line {
  std::optional<Gesture> gesture;
  std::chrono::milliseconds hold{0};
  std::string user;
  Words words;
};

constexpr std::chrono::minutes kLongestHold{10};

std::chrono::milliseconds parseHold(std::string_view text) {
  const auto time = readTime(text).value_or(std::chrono::nanoseconds(0));
  const auto milliseconds = std::chrono::round<std::chrono::milliseconds>(time);
  if (milliseconds.count() < 1 || time > kLongestHold) {
    throw UsageError("a button can be held for 1ms to 10m (500ms, 1.5s, 1m30s), not " + inQuotes(text));
  }
  return milliseconds;
}

bool isOption(std::string_view word) {
  // A hyphen before a digit is a negative number's.
  return word.size() > 1 && word[0] == '-' && (word[1] < '0' || word[1] > '9');
}

void setGesture(Line& line, Gesture gesture) {
  if (line.gesture) throw UsageError("only one of --press, --release, --hold and --raw");
  line.gesture = gesture;
}

Line takeApart(std::span<const char* const> arguments) {
  constexpr std::string_view kHoldEquals = "--hold=";
  Line line;
  for (std::size_t index = 0; index < arguments.size(); ++index) {
    const std::string_view word = arguments[index];
    if (!isOption(word)) {
      line.words.push_back(word);
    } else if (word == "--press") {
      setGesture(line, Gesture::Press);
    } else if (word == "--release") {
      setGesture(line, Gesture::Release);
    } else if (word == "--raw") {
      setGesture(line, Gesture::Raw);
    } else if (word == "--hold") {
      setGesture(line, Gesture::Hold);
      if (++index == arguments.size()) throw UsageError("--hold needs a time, such as 2s");
      line.hold = parseHold(arguments[index]);
    } else if (word == "--user") {
      if (++index == arguments.size()) throw UsageError("--user needs a name");
      line.user = arguments[index];
    } else if (word.starts_with(kHoldEquals)) {
      setGesture(line, Gesture::Hold);
      line.hold = parseHold(word.substr(kHoldEquals.size()));
    } else {
      throw UsageError("unknown option " + inQuotes(word));
    }
  }
  return line;
}

Arguments withAction(Action action) {
  Arguments arguments;
  arguments.action = action;
  return arguments;
}

Arguments parseRaw(const Words& words) {
  if (words.size() < 3 || words.size() > 4) throw UsageError("--raw takes PAGE USAGE VALUE [EXTRA]");
  Arguments arguments = withAction(Action::SendButton);
  arguments.usagePage = parseNumber<std::uint16_t>("the usage page", words[0]);
  arguments.usage = parseNumber<std::uint16_t>("the usage", words[1]);
  arguments.values = {parseNumber<std::int32_t>("the value", words[2])};
  if (words.size() == 4) arguments.extra = parseNumber<std::uint16_t>("the extra field", words[3]);
  return arguments;
}

Arguments parseButton(const Line& line) {
  const Button& button = knownButton(line.words[0]);
  if (line.words.size() > 1) throw UsageError("one button at a time, without " + inQuotes(line.words[1]));
  Arguments arguments = withAction(Action::SendButton);
  arguments.usagePage = button.usagePage;
  arguments.usage = button.usage;
  arguments.hold = line.hold;
  switch (line.gesture.value_or(Gesture::Tap)) {
    case Gesture::Press:
      arguments.values = {kPressed};
      break;
    case Gesture::Release:
      arguments.values = {kReleased};
      break;
    case Gesture::Hold:
      arguments.values = {kPressed, kReleased};
      break;
    default: {
      const std::span<const std::int32_t> values = tapValues(button);
      arguments.values.assign(values.begin(), values.end());
    }
  }
  return arguments;
}

Arguments parseCommand(Action action, const Line& line) {
  const std::string_view command = line.words[0];
  if (line.gesture) throw UsageError(inQuotes(command) + " is not a button");
  Arguments arguments = withAction(action);
  if (action == Action::SetScreenLocked) {
    const std::string_view state = line.words.size() == 2 ? line.words[1] : "";
    if (state != "on" && state != "off") throw UsageError("lock takes 'on' or 'off'");
    arguments.locked = state == "on";
  } else if (line.words.size() > 1) {
    throw UsageError(inQuotes(command) + " takes nothing after it");
  }
  return arguments;
}

Arguments parseLine(const Line& line) {
  if (line.gesture == Gesture::Raw) return parseRaw(line.words);
  if (line.words.empty()) throw UsageError("no button given (see kvremote --help)");
  if (line.words[0] == "list") return parseCommand(Action::ListButtons, line);
  if (line.words[0] == "lock") return parseCommand(Action::SetScreenLocked, line);
  if (line.words[0] == "quit") return parseCommand(Action::Terminate, line);
  return parseButton(line);
}

}  // namespace

Arguments parseArguments(std::span<const char* const> words) {
  for (const std::string_view word : words) {
    if (word == "--help" || word == "-h") return withAction(Action::ShowHelp);
    if (word == "--version") return withAction(Action::ShowVersion);
  }
  const Line line = takeApart(words);
  Arguments arguments = parseLine(line);
  arguments.user = line.user;
  return arguments;
}

}  // namespace remote
