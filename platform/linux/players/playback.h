// Playing, standing still and playing fast: what the roles that play have in common.
#pragma once

#include "platform/linux/players/mpris.h"
#include "platform/linux/programs/running.h"

namespace desktop {

/// The player of an instance; throws tarnscript::Refusal when it has none on the bus.
Player& requirePlayer(const Instance& instance);

/// Plays at the player's own rate, and pauses what else plays in the same role.
void startPlaying(const Instance& instance);

/// Pauses it, and whatever else plays in the same role: the sound ends; window, film and place stay.
void endPlaying(const Instance& instance);

/// Whether it plays, at whatever rate, or is scanned.
bool isPlaying(Player& player);

/// How fast it plays: 0 stands still, 1 is normal, negative goes back.
double rateOf(Player& player);

/// Plays at a rate, 0 to stand still: by the player's own where it has such a one, else by scanning, which
/// leaves a player that stands still silent.
void playAtRate(const Instance& instance, double rate);

/// Goes back to the rate at which the player played before it was made to play fast or to scan.
void endFastPlaying(Player& player);

}  // namespace desktop
