#include "simulator/evenings.h"

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <random>
#include <string_view>

#include "remote/buttons.h"
#include "remote/words.h"
#include "simulator/failures.h"
#include "simulator/rehearsal.h"

namespace simulator {

namespace {

struct Happening {
  int weight;
  int times;  ///< how often it happens at once
  /// A command with alternatives in braces: {on|off} is one of the two, {5} a number from 0 to 4, and the
  /// words below stand for longer lists.
  std::string_view command;
};

constexpr Happening kHappenings[] = {
    {20, 1, "tap {button}"},
    {4, 1, "press {button}"},  // its release is lost
    {4, 1, "release {button}"},
    {4, 1, "hold {button} {time}"},
    {3, 3, "press {button}"},  // a key that bounces
    {1, 80, "press {button}"},
    {3, 1, "raw {14} {256} {3} {65536}"},
    {3, 1, "datagram {bytes}"},
    {6, 1, "open {application}"},
    {2, 1, "open {application} again"},
    {4, 1, "close {application}"},
    {5, 1, "front {application}"},
    {1, 1, "front nobody"},
    {4, 1, "answers {application} {normally|normally|nothing|errors}"},
    {1, 1, "hang {application} {300ms|4s|40s}"},
    {2, 1, "version snapvale {6.0.6|7.1|8.1.2|9|none|x.y|99999999999.1}"},
    {3, 1, "{break|mend|mend} {window-server|display-query|process-lookup|event-records}"},
    {1, 1, "displays {12}"},
    {2, 1, "capture {10} {on|off}"},
    {3, 1, "lock {on|off}"},
    {2, 1, "volume {0|50|95|99|100}"},
    {2, 1, "mute {on|off}"},
    {2, 1, "disc {in|in|out}"},
    {2, 1, "tell lyrabox to {play|stop|pause|fast forward|rewind}"},
    {2, 1, "tell spindle to {play dvd|pause dvd|stop dvd|rewind dvd|go to main menu}"},
    {2, 1, "tell com.tarn.vistremeplayer to {play front movie|set rate of front movie to 2.0}"},
    {2, 1, "tell com.tarn.VistremePlayerX to {play front document|set rate of front document to -4.0}"},
    {1, 1, "tell snapvale to {start|stop} slideshow"},
    {2, 1, "tell slidewell to {start slideshow|stop slideshow|show slide switcher}"},
};

constexpr std::string_view kTimes = "20ms|400ms|1.1s|3s|11s|45s|4m";
constexpr std::string_view kApplications =
    "com.tarn.Lyrabox|com.tarn.Spindle|com.tarn.vistremeplayer|com.tarn.VistremePlayerX|com.tarn.Snapvale|"
    "com.tarn.Lumbra|com.tarn.Officra.Slidewell|com.example.Editor";

class Dice {
 public:
  explicit Dice(std::uint64_t seed) : engine_(seed) {}
  /// 0 to sides − 1. The remainder: the standard's distributions differ from library to library.
  std::uint64_t roll(std::uint64_t sides) { return engine_() % sides; }

 private:
  std::mt19937_64 engine_;
};

std::string oneOf(std::string_view alternatives, Dice& dice) {
  const auto count = static_cast<std::uint64_t>(std::ranges::count(alternatives, '|')) + 1;
  for (std::uint64_t skipped = dice.roll(count); skipped > 0; --skipped) {
    alternatives.remove_prefix(alternatives.find('|') + 1);
  }
  return std::string(alternatives.substr(0, alternatives.find('|')));
}

std::string randomBytes(Dice& dice) {
  std::string text;
  for (std::uint64_t left = 1 + dice.roll(60); left > 0; --left) {
    for (int digit = 0; digit < 2; ++digit) text += "0123456789abcdef"[dice.roll(16)];
  }
  return text;
}

/// What stands for the text between braces this time.
std::string choose(std::string_view text, Dice& dice) {
  if (text == "button") return std::string(remote::buttons()[dice.roll(remote::buttons().size())].name);
  if (text == "application") return oneOf(kApplications, dice);
  if (text == "time") return oneOf(kTimes, dice);
  if (text == "bytes") return randomBytes(dice);
  if (text.find('|') != std::string_view::npos) return oneOf(text, dice);
  return std::to_string(dice.roll(remote::parseNumber<std::uint32_t>("sides", text)));
}

std::string fillIn(std::string_view command, Dice& dice) {
  std::string filled;
  for (std::size_t open; (open = command.find('{')) != std::string_view::npos;) {
    const std::size_t close = command.find('}');
    filled += command.substr(0, open);
    filled += choose(command.substr(open + 1, close - open - 1), dice);
    command.remove_prefix(close + 1);
  }
  return filled += command;
}

const Happening& chooseHappening(Dice& dice) {
  int sum = 0;
  for (const Happening& each : kHappenings) sum += each.weight;
  auto left = static_cast<int>(dice.roll(static_cast<std::uint64_t>(sum)));
  const Happening* chosen = kHappenings;
  while ((left -= chosen->weight) >= 0) ++chosen;
  return *chosen;
}

}  // namespace

std::vector<std::string> evening(std::uint64_t seed) {
  Dice dice(seed);
  std::vector<std::string> commands;
  constexpr std::chrono::hours kLength(1);
  for (std::chrono::nanoseconds time{}; time < kLength;) {
    for (std::uint64_t left = dice.roll(6); left > 0; --left) {
      const Happening& happening = chooseHappening(dice);
      commands.insert(commands.end(), static_cast<std::size_t>(happening.times),
                      fillIn(happening.command, dice));
    }
    const std::string rest = oneOf(kTimes, dice);
    commands.push_back("wait " + rest);
    time += remote::parseTime(rest);
  }
  // Then everybody goes to bed, or somebody ends kvd.
  commands.push_back(oneOf("wait 2h30m|quit", dice));
  return commands;
}

bool playEvenings(std::uint64_t count, std::uint64_t firstSeed) {
  const auto begin = std::chrono::steady_clock::now();
  const std::size_t parts = workerCount();
  const auto commands = inParallel(parts, [&](std::size_t part) -> std::optional<Failure> {
    for (std::uint64_t i = part; i < count; i += parts) {
      auto failure = rehearse(evening(firstSeed + i));
      if (!failure) continue;
      std::printf("seed %llu\n", static_cast<unsigned long long>(firstSeed + i));
      return shortest(*std::move(failure));
    }
    return std::nullopt;
  });
  if (!commands) return false;
  const std::chrono::duration<double> taken = std::chrono::steady_clock::now() - begin;
  std::printf("%llu evenings from seed %llu, %llu commands, %.0f evenings a second\n",
              static_cast<unsigned long long>(count), static_cast<unsigned long long>(firstSeed),
              static_cast<unsigned long long>(*commands), static_cast<double>(count) / taken.count());
  return true;
}

}  // namespace simulator
