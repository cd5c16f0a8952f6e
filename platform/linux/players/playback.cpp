#include "platform/linux/players/playback.h"

#include <utility>

#include "platform/linux/players/scan.h"
#include "platform/tarnscript/tarnscript.h"

namespace desktop {

namespace {

/// From here on a rate is a scan's, which somebody else may have begun, and not one at which people watch.
constexpr double kSlowestScan = 2;

void standStill(Player& player) {
  pause(player);
  endFastPlaying(player);
}

/// Only one plays at a time, in one role too.
void pauseOthers(const Instance& chosen) {
  for (const Instance* other : instancesOf(chosen.role)) {
    Player* const player = other != &chosen ? playerOf(*other) : nullptr;
    if (player == nullptr) continue;
    try {
      standStill(*player);
    } catch (const tarnscript::Refusal&) {
      // One that does not answer does not keep the chosen one from playing.
    }
  }
}

}  // namespace

Player& requirePlayer(const Instance& instance) {
  Player* const player = playerOf(instance);
  if (player == nullptr) throw tarnscript::Refusal{"its player is not on the bus"};
  return *player;
}

void startPlaying(const Instance& instance) {
  Player& player = requirePlayer(instance);
  pauseOthers(instance);
  endFastPlaying(player);
  play(player);
}

void endPlaying(const Instance& instance) {
  pauseOthers(instance);
  standStill(requirePlayer(instance));
}

bool isPlaying(Player& player) { return scanRate(player) || statusOf(player) == PlaybackStatus::Playing; }

double rateOf(Player& player) {
  if (const auto rate = scanRate(player)) return *rate;
  return statusOf(player) == PlaybackStatus::Playing ? stateOf(player).rate : 0;
}

void playAtRate(const Instance& instance, double rate) {
  Player& player = requirePlayer(instance);
  if (rate == 0) return standStill(player);
  const PlayerState state = stateOf(player);
  if (rate == 1 && player.ownRate) return startPlaying(instance);
  pauseOthers(instance);
  if (!takesRate(player, state, rate)) {
    if (rate == 1) return startPlaying(instance);
    endFastPlaying(player);
    return scan(player, rate);
  }
  endScan(player);
  if (rate != 1 && !player.ownRate) player.ownRate = state.rate < kSlowestScan ? state.rate : 1;
  setRate(player, rate);
  play(player);
}

void endFastPlaying(Player& player) {
  endScan(player);
  if (const auto rate = std::exchange(player.ownRate, std::nullopt)) setRate(player, *rate);
}

}  // namespace desktop
