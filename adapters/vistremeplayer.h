// The classic movie player.
#pragma once

#include <cstdint>

/// Acts on a button; the value is non-zero when it was pressed. True when the button is one of the classic
/// movie player's.
bool VistremePlayerHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);

/// Whether the front movie plays; false when it does not answer.
bool VistremePlayer_IsPlaying();
