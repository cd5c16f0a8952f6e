#include "adapters/snapvale.h"

bool SnapvaleHandleHIDEvent(std::uint32_t, std::uint32_t, std::int32_t) { return false; }
