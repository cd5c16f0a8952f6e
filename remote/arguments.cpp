#include "remote/arguments.h"

#include <charconv>
#include <cmath>
#include <limits>
#include <optional>
#include <string>
#include <string_view>
#include <system_error>

#include "remote/buttons.h"

namespace remote {
namespace {

using Words = std::vector<std::string_view>;

enum class Gesture { Tap, Press, Release, Hold, Raw };

// A command line taken apart: what begins with a hyphen, and the words that are left.
struct Line {
  std::optional<Gesture> gesture;
  std::chrono::milliseconds hold{0};
  Words words;
};

constexpr std::chrono::milliseconds kShortestHold{1};
constexpr std::chrono::milliseconds kLongestHold = std::chrono::minutes(10);

std::string quoted(std::string_view word) { return "'" + std::string(word) + "'"; }

std::string joined(const std::vector<std::string>& words) {
  std::string result;
  for (const std::string& word : words) result += (result.empty() ? "" : ", ") + word;
  return result;
}

/// Reads a time such as 2s, 500ms, 1.5s or 1m; a bare number is seconds.
std::chrono::milliseconds parseTime(std::string_view text) {
  double number = 0;
  const char* end = text.data() + text.size();
  const auto [rest, error] = std::from_chars(text.data(), end, number, std::chars_format::fixed);
  const std::string_view unit(rest, static_cast<std::size_t>(end - rest));
  double milliseconds = std::numeric_limits<double>::quiet_NaN();
  if (unit == "ms") milliseconds = number;
  if (unit == "s" || unit.empty()) milliseconds = number * 1e3;
  if (unit == "m") milliseconds = number * 60e3;
  if (error != std::errc() || std::isnan(milliseconds)) {
    throw UsageError("not a time: " + quoted(text) + " (2s, 500ms, 1.5s, 1m)");
  }
  if (milliseconds < static_cast<double>(kShortestHold.count()) ||
      milliseconds > static_cast<double>(kLongestHold.count())) {
    throw UsageError("a button can be held for 1ms to 10m, not " + quoted(text));
  }
  return std::chrono::milliseconds(std::llround(milliseconds));
}

/// Reads a decimal or 0x hexadecimal number that fits Integer.
template <typename Integer>
Integer parseNumber(std::string_view what, std::string_view text) {
  std::string_view digits = text;
  const bool negative = digits.starts_with('-');
  if (negative) digits.remove_prefix(1);
  const bool hexadecimal = digits.starts_with("0x") || digits.starts_with("0X");
  if (hexadecimal) digits.remove_prefix(2);

  // Read as an unsigned number, so that a second sign is an error.
  std::uint64_t magnitude = 0;
  const char* end = digits.data() + digits.size();
  const auto [rest, error] = std::from_chars(digits.data(), end, magnitude, hexadecimal ? 16 : 10);
  if (error == std::errc::invalid_argument || rest != end) {
    throw UsageError("not a number for " + std::string(what) + ": " + quoted(text));
  }
  constexpr std::int64_t kLeast = std::numeric_limits<Integer>::min();
  constexpr std::int64_t kMost = std::numeric_limits<Integer>::max();
  const std::uint64_t largest = static_cast<std::uint64_t>(negative ? -kLeast : kMost);
  if (error != std::errc() || magnitude > largest) {
    throw UsageError(std::string(what) + " is " + std::to_string(kLeast) + " to " + std::to_string(kMost) +
                     ", not " + std::string(text));
  }
  const auto number = static_cast<std::int64_t>(magnitude);
  return static_cast<Integer>(negative ? -number : number);
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
      line.hold = parseTime(arguments[index]);
    } else if (word.starts_with(kHoldEquals)) {
      setGesture(line, Gesture::Hold);
      line.hold = parseTime(word.substr(kHoldEquals.size()));
    } else {
      throw UsageError("unknown option " + quoted(word));
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

const Button& knownButton(std::string_view name) {
  if (const Button* button = findButton(name)) return *button;
  const std::vector<std::string> nearest = nearestButtonNames(name);
  throw UsageError(
      "unknown button " + quoted(name) +
      (nearest.empty() ? " ('kvremote list' shows them all)" : ", did you mean " + joined(nearest) + "?"));
}

Arguments parseButton(const Line& line) {
  const Button& button = knownButton(line.words[0]);
  if (line.words.size() > 1) throw UsageError("one button at a time, without " + quoted(line.words[1]));
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
  if (line.gesture) throw UsageError(quoted(command) + " is not a button");
  Arguments arguments = withAction(action);
  if (action == Action::SetScreenLocked) {
    const std::string_view state = line.words.size() == 2 ? line.words[1] : "";
    if (state != "on" && state != "off") throw UsageError("lock takes 'on' or 'off'");
    arguments.locked = state == "on";
  } else if (line.words.size() > 1) {
    throw UsageError(quoted(command) + " takes nothing after it");
  }
  return arguments;
}

}  // namespace

Arguments parseArguments(std::span<const char* const> words) {
  for (const std::string_view word : words) {
    if (word == "--help" || word == "-h") return withAction(Action::ShowHelp);
    if (word == "--version") return withAction(Action::ShowVersion);
  }
  const Line line = takeApart(words);
  if (line.gesture == Gesture::Raw) return parseRaw(line.words);
  if (line.words.empty()) throw UsageError("no button given (see kvremote --help)");
  if (line.words[0] == "list") return parseCommand(Action::ListButtons, line);
  if (line.words[0] == "lock") return parseCommand(Action::SetScreenLocked, line);
  if (line.words[0] == "quit") return parseCommand(Action::Terminate, line);
  return parseButton(line);
}

}  // namespace remote
