#include "adapters/vistremeplayerx.h"

bool VistremePlayerXHandleHIDEvent(std::uint32_t, std::uint32_t, std::int32_t) { return false; }

bool VistremePlayerX_IsPlaying() { return false; }
