// Scanning: fast playing in either direction, for players that have no such rate.
//
// A timer seeks again and again until the scan is ended or the player has gone. While it goes on, the rate
// that was asked for is the player's rate, so that a script that doubles the rate it reads climbs.
#pragma once

#include <optional>

#include "platform/linux/players/mpris.h"

namespace linux::players {

/// Begins scanning at a rate (times the normal speed, negative is backward), or goes on at another one.
void scan(Player& player, double rate);

/// Ends it, where one goes on; what played plays on at its normal rate, what was paused stays so.
void endScan(Player& player);

/// Ends it without a word to the player, which may have been paused for it.
void giveUpScan(const Player& player);

/// The rate asked for; nothing while the player is not scanning.
std::optional<double> scanRate(const Player& player);

}  // namespace linux::players
