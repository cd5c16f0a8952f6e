// Scripts as host objects: what stands between the script operations of platform/host.h and the engine. Both
// hosts use it; each gives it the applications of its own desktop.
#pragma once

#include <functional>
#include <string>

#include "platform/tarnscript/tarnscript.h"

namespace scripting {

/// What a host wants of scripts.
struct Hooks {
  /// The applications that scripts can name; outlives every run.
  tarnscript::World* world = nullptr;
  /// Told before a script is compiled and after it ended; may be empty.
  std::function<void(const std::string& source)> started;
  std::function<void(const tarnscript::Outcome& outcome)> ended;
};
void setHooks(Hooks hooks);

}  // namespace scripting
