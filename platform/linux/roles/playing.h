// Playing in a role: one of its programs at a time.
#pragma once

#include "platform/linux/roles/performer.h"

namespace linux::roles {

/// Plays at the player's own rate, and pauses what else plays in the same role.
void startPlaying(const Performer& performer);

/// Pauses it, and whatever else plays in the same role: the sound ends; window, film and place stay.
void endPlaying(const Performer& performer);

/// Plays at a rate, 0 to stand still, and pauses what else plays in the same role.
void playAtRate(const Performer& performer, double rate);

}  // namespace linux::roles
