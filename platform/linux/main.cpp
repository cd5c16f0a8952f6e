#include "daemon/lifecycle.h"
#include "platform/base/port_names.h"
#include "platform/base/run_loop.h"
#include "platform/linux/bus.h"
#include "platform/linux/script_world.h"

int main() {
  base::endLoopOnSignals();
  base::bootstrapIsThere = [] { return desktop::bus() != nullptr; };
  desktop::letScriptsFindRoles();
  return KVDMain();
}
