// Draws the screen.
#pragma once

#include "platform/screen/state.h"
#include "platform/stage/desktop.h"

namespace live {

/// Draws everything anew; the terminal gets what differs from last time. Notes in the state how far there was
/// to scroll.
void paint(State& state, const stage::Desktop& desktop);

}  // namespace live
