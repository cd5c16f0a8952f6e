// The disc player.
#pragma once

#include <cstdint>

#include "daemon/kvd.h"

/// Acts on a whole event, extra field included; the value is non-zero when the button was pressed. True when
/// the button is one of the disc player's.
bool dispatchToSpindle(PackedHIDEvent event, std::int32_t value);

/// Whether the disc plays; false when the player does not answer.
bool Spindle_IsPlaying();
/// Whether a disc menu shows; false when the player does not answer.
bool Spindle_AtMenu();
