#include "adapters/slidewell.h"

bool SlidewellHandleHIDEvent(std::uint32_t, std::uint32_t, std::int32_t) { return false; }

bool Slidewell_IsPlaying() { return false; }
