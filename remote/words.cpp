#include "remote/words.h"

#include <cmath>
#include <iterator>

namespace remote {
namespace {

struct Unit {
  std::string_view name;
  double nanoseconds;
};

// Before a unit that another one begins with, the longer.
constexpr Unit kUnits[] = {{"ms", 1e6}, {"h", 3600e9}, {"m", 60e9}, {"s", 1e9}};
constexpr double kYear = 365.0 * 24 * 3600e9;

}  // namespace

std::string inQuotes(std::string_view word) { return std::string(1, '\'').append(word) + '\''; }

std::optional<std::chrono::nanoseconds> readTime(std::string_view text) {
  double total = 0;
  std::string_view rest = text;
  do {
    double number = 0;
    const char* const end = rest.data() + rest.size();
    const auto [behind, error] = std::from_chars(rest.data(), end, number, std::chars_format::fixed);
    // from_chars takes "inf" and "nan" for numbers too.
    if (error != std::errc() || !std::isfinite(number) || std::signbit(number)) return std::nullopt;
    const bool bare = rest.data() == text.data() && behind == end;
    rest = std::string_view(behind, static_cast<std::size_t>(end - behind));
    const Unit* unit = std::begin(kUnits);
    while (unit != std::end(kUnits) && !rest.starts_with(unit->name)) ++unit;
    if (unit == std::end(kUnits) && !bare) return std::nullopt;
    total += number * (bare ? 1e9 : unit->nanoseconds);
    if (!bare) rest.remove_prefix(unit->name.size());
  } while (!rest.empty());
  if (total > kYear) return std::nullopt;
  return std::chrono::nanoseconds(std::llround(total));
}

std::chrono::nanoseconds parseTime(std::string_view text) {
  if (const auto time = readTime(text)) return *time;
  throw UsageError("not a time: " + inQuotes(text) + " (2s, 500ms, 1.5s, 2h10m; at most a year)");
}

}  // namespace remote
