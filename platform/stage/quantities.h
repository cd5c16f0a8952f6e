// Numbers and times as people read them.
#pragma once

#include <string>

#include "platform/stage/clock.h"

namespace stage {

/// A number in at most six digits: "50", "0.5".
std::string numberText(double number);

/// A length of time: "0.05s", "1.05s", "10m", "2h10m".
std::string timeText(Nanoseconds duration);

/// A position in what plays, minutes and seconds: "3:05".
std::string positionText(Nanoseconds position);

}  // namespace stage
