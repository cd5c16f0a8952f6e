// What each key does.
#pragma once

#include "platform/terminal/keypress.h"
#include "platform/terminal/state.h"

namespace terminal {

void handle(State& state, const Keypress& key);

}  // namespace terminal
