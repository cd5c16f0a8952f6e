// The professional photo application.
#pragma once

#include <cstdint>

/// Acts on a button; the value is non-zero when it was pressed. True when the button is one of the
/// professional photo application's.
bool LumbraHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);
