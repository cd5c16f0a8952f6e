// Draws the screen.
#pragma once

#include "platform/stage/desktop.h"
#include "platform/terminal/state.h"

namespace terminal {

/// Draws everything anew; the terminal gets what differs from last time. Notes in the state how far there was
/// to scroll.
void paint(State& state, const stage::Desktop& desktop);

}  // namespace terminal
