// The volume buttons, offered every event before a target is chosen.
#pragma once

#include <cstdint>

#include "daemon/kvd.h"

/// Takes a volume button, unless an application must have it. True when the event was handled.
bool dispatchVolumeEvent(PackedHIDEvent event, std::int32_t value);
