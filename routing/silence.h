// One player at a time.
#pragma once

#include "daemon/kvd.h"

/// Pauses or stops every other application before `appCode` starts to play.
void SilenceAllBut(AppCode appCode);
