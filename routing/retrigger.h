// The repeat of a held button: at most one at a time.
#pragma once

#include "daemon/kvd.h"

/// The timer of the running repeat, null when there is none.
extern HostTimerRef sRetriggerTimer;

/// Ends a running repeat; does nothing without one.
void stopRetrigger();
