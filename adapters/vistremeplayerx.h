// The modern movie player.
#pragma once

#include <cstdint>

/// Acts on a button; the value is non-zero when it was pressed. True when the button is one of the modern
/// movie player's.
bool VistremePlayerXHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);

/// Whether the front document plays; false when it does not answer.
bool VistremePlayerX_IsPlaying();
