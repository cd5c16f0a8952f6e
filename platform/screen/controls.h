// What each key does.
#pragma once

#include "platform/screen/keypress.h"
#include "platform/screen/state.h"

namespace live {

void handle(State& state, const Keypress& key);

}  // namespace live
