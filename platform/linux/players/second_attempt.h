// Players that answer Play and do nothing: some obey only PlayPause.
#pragma once

#include "platform/linux/players/players.h"

namespace linux::players {

/// To be called when the player has just been told to play, and nobody knows what it is like: looks after a
/// second whether it does. One that still stands still gets PlayPause, once. Nothing happens when in the
/// meantime any player was told to do something or began to play: two shall not play at once.
void attemptAgain(const Player& player);

}  // namespace linux::players
