// Playing, standing still and playing fast, on one player.
#pragma once

#include "platform/linux/players/mpris.h"

namespace linux::players {

/// Plays at the player's own rate.
void start(Player& player);

/// Pauses it and ends fast playing: the sound ends; window, film and place stay.
void standStill(Player& player);

/// Whether it plays, at whatever rate, or is scanned.
bool isPlaying(Player& player);

/// How fast it plays: 0 stands still, 1 is normal, negative goes back.
double rateOf(Player& player);

/// Plays a player in this state at a rate other than 0: by its own where it has such a one, else by scanning,
/// which leaves a player that stands still silent.
void playAtRate(Player& player, const PlayerState& state, double rate);

/// Goes back to the rate at which the player played before it was made to play fast or to scan.
void endFastPlaying(Player& player);

}  // namespace linux::players
