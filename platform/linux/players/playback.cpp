#include "platform/linux/players/playback.h"

#include <utility>

#include "platform/linux/players/scan.h"
#include "platform/linux/players/second_attempt.h"

namespace linux::players {

namespace {

/// From here on a rate is a scan's, which somebody else may have begun, and not one at which people watch.
constexpr double kSlowestScan = 2;

void endOwnFastPlaying(Player& player) {
  if (const auto rate = std::exchange(player.ownRate, std::nullopt)) setRate(player, *rate);
}

}  // namespace

void start(Player& player) {
  endFastPlaying(player);
  play(player);
  if ((player.quirks & kUnknown) != 0) attemptAgain(player);
}

void standStill(Player& player) {
  giveUpScan(player);
  pause(player);
  endFastPlaying(player);
}

bool isPlaying(Player& player) { return scanRate(player) || statusOf(player) == PlaybackStatus::Playing; }

double rateOf(Player& player) {
  if (const auto rate = scanRate(player)) return *rate;
  return statusOf(player) == PlaybackStatus::Playing ? stateOf(player).rate : 0;
}

void playAtRate(Player& player, const PlayerState& state, double rate) {
  if (rate == 1 && (player.ownRate || scanRate(player))) return start(player);
  if (!takesRate(player, state, rate)) {
    if (rate == 1) return start(player);
    endOwnFastPlaying(player);
    return scan(player, rate);
  }
  endScan(player);
  if (rate != 1 && !player.ownRate) player.ownRate = state.rate < kSlowestScan ? state.rate : 1;
  setRate(player, rate);
  play(player);
}

void endFastPlaying(Player& player) {
  endScan(player);
  endOwnFastPlaying(player);
}

}  // namespace linux::players
