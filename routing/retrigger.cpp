#include "routing/retrigger.h"

HostTimerRef sRetriggerTimer;

void stopRetrigger() {}
