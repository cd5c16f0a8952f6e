// The consumer photo library.
#pragma once

#include <cstdint>

/// Acts on a button; the value is non-zero when it was pressed. True when the button is one of the consumer
/// photo library's.
bool SnapvaleHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);
