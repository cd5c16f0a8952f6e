// Words that people write as arguments: times, numbers, and what to say when they are wrong.
#pragma once

#include <charconv>
#include <chrono>
#include <cstdint>
#include <limits>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <system_error>

namespace remote {

/// What is wrong with a command line, as one line for its author.
struct UsageError : std::runtime_error {
  using std::runtime_error::runtime_error;
};

/// The word in single quotes.
std::string inQuotes(std::string_view word);

/// Reads a time such as 2s, 500ms, 1.5s, 1m, 2h or 2h10m; a bare number is seconds. Nothing for another text,
/// and for more than a year.
std::optional<std::chrono::nanoseconds> readTime(std::string_view text);

/// The same for a text that must be one; throws UsageError.
std::chrono::nanoseconds parseTime(std::string_view text);

/// Reads a decimal or 0x hexadecimal number that fits Integer. `what` names it in the UsageError for all
/// others.
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
    throw UsageError("not a number for " + std::string(what) + ": " + inQuotes(text));
  }
  constexpr std::int64_t kLeast = std::numeric_limits<Integer>::min();
  constexpr std::int64_t kMost = std::numeric_limits<Integer>::max();
  const auto largest = static_cast<std::uint64_t>(negative ? -kLeast : kMost);
  if (error != std::errc() || magnitude > largest) {
    throw UsageError(std::string(what) + " is " + std::to_string(kLeast) + " to " + std::to_string(kMost) +
                     ", not " + std::string(text));
  }
  const auto number = static_cast<std::int64_t>(magnitude);
  return static_cast<Integer>(negative ? -number : number);
}

}  // namespace remote
