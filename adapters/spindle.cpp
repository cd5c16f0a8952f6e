#include "adapters/spindle.h"

bool dispatchToSpindle(PackedHIDEvent, std::int32_t) { return false; }

bool Spindle_IsPlaying() { return false; }

bool Spindle_AtMenu() { return false; }
