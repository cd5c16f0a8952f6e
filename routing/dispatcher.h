// The road from a received button to an application.
#pragma once

#include <cstdint>

#include "daemon/kvd.h"

/// The screen-locked state at the last new event; repeats of a held button reuse it.
extern bool sScreenLocked;

/// Dispatches a newly received event: ends a running repeat, forgets the last target and routes the event.
/// True when it was handled. Bits above the low 48 are ignored.
bool DispatchHIDEvent(PackedHIDEvent event, std::int32_t value, bool screenLocked);

/// Routes one event, new or repeated: volume handling first, then the target's adapter. With no target and
/// the screen unlocked a play button launches the music jukebox, which does not count as handling it.
bool doDispatch(PackedHIDEvent event, std::int32_t value, bool screenLocked);
