#include "platform/linux/roles/playing.h"

#include "platform/linux/players/playback.h"
#include "platform/tarnscript/tarnscript.h"

namespace linux::roles {

namespace {

/// Only one plays at a time, in one role too.
void pauseOthers(const Performer& chosen) {
  for (const programs::Instance& other : programs::instances()) {
    if (other.role != chosen.instance().role || &other == &chosen.instance()) continue;
    players::Player* const player = programs::playerOf(other);
    if (player == nullptr) continue;
    try {
      players::standStill(*player);
    } catch (const tarnscript::Refusal&) {
      // One that does not answer does not keep the chosen one from playing.
    }
  }
}

}  // namespace

void startPlaying(const Performer& performer) {
  players::Player& player = performer.player();
  pauseOthers(performer);
  players::start(player);
}

void endPlaying(const Performer& performer) {
  pauseOthers(performer);
  players::standStill(performer.player());
}

void playAtRate(const Performer& performer, double rate) {
  players::Player& player = performer.player();
  if (rate == 0) return players::standStill(player);
  const players::PlayerState state = players::stateOf(player);
  pauseOthers(performer);
  players::playAtRate(player, state, rate);
}

}  // namespace linux::roles
