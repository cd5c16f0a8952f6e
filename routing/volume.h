// The volume buttons: the platform's own sound keys, and the player's own volume when the output is at its
// top.
#pragma once

#include <cstdint>

#include "daemon/kvd.h"

/// Takes a volume button, unless the disc player or the professional photo application must have it. True
/// when the event was handled.
bool dispatchVolumeEvent(PackedHIDEvent event, std::int32_t value);

/// Presses (value non-zero) or releases the sound-up key and repeats a press. At full output volume a press
/// also unmutes the output and raises the target player's own volume.
void dispatchVolumeUpCommand(std::int32_t value);
/// Presses or releases the sound-down key and repeats a press; looks at neither level nor mute.
void dispatchVolumeDownCommand(std::int32_t value);

/// Posts a system sound-key event: key type << 16 | key state << 8 | repeat. 1 when it was posted, else 0.
int dispatchSystemVolumeEvent(std::uint32_t dataWord);
