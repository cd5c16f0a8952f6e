// For whoever tells why the core chooses as it does.
#pragma once

#include <functional>

#include "platform/linux/programs/role.h"

namespace linux::host {

/// Told of the questions on which the core's choice rests, when they are answered; each may be empty.
struct Listener {
  /// The role of the program in front, None for nobody who plays one.
  std::function<void(programs::Role front)> whoIsInFront;
  /// The core asked after this role's program, which runs.
  std::function<void(programs::Role role)> whoRuns;
};
void setListener(Listener listener);

}  // namespace linux::host
