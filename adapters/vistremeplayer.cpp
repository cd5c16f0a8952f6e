#include "adapters/vistremeplayer.h"

bool VistremePlayerHandleHIDEvent(std::uint32_t, std::uint32_t, std::int32_t) { return false; }

bool VistremePlayer_IsPlaying() { return false; }
