// The consumer photo library, in three generations by its major version: 8 and later, 7, and everything
// before (a version that cannot be read counts as that).
#pragma once

#include <cstdint>

/// Acts on a button, whatever the value. True when the button counts as one of the consumer photo library's.
bool SnapvaleHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);

/// The answer of the slideshow query, non-zero while one runs; 0 when the application does not answer.
/// Nothing in the daemon calls it.
std::int32_t SnapvaleSlideShowPlaying();
