// The presentation application.
#pragma once

#include <cstdint>

/// Acts on a button; the value is non-zero when it was pressed. True when the button is one of the
/// presentation application's.
bool SlidewellHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);

/// Whether a slideshow plays; false when it does not answer.
bool Slidewell_IsPlaying();
