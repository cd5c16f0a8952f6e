#include "adapters/lumbra.h"

bool LumbraHandleHIDEvent(std::uint32_t, std::uint32_t, std::int32_t) { return false; }
