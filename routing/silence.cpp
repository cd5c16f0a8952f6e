#include "routing/silence.h"

void SilenceAllBut(AppCode) {}
