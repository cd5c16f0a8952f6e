#include "routing/volume.h"

bool dispatchVolumeEvent(PackedHIDEvent, std::int32_t) { return false; }
