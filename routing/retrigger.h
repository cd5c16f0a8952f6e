// The repeat of a held button: at most one at a time, fed back into the dispatcher by a timer until the next
// event arrives or its time is over.
#pragma once

#include <cstdint>

#include "daemon/kvd.h"

/// The timer of the running repeat, null when there is none.
extern HostTimerRef sRetriggerTimer;

/// Starts to repeat an event: first after 1.05 s, then every `period` seconds, until `duration` seconds from
/// now have passed (0: without limit). Does nothing for a value of 0 or while a repeat runs.
void retrigger(HIDEvent event, std::int32_t value, double period, double duration);

/// One firing: dispatches the stored event once more, or ends a repeat that has gone on for too long.
void retriggerCallback(HostTimerRef timer, void* context);

/// Ends a running repeat; does nothing without one.
void stopRetrigger();
