#include "daemon/lifecycle.h"
#include "platform/base/port_names.h"
#include "platform/base/run_loop.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/roles/script_world.h"

int main() {
  base::endLoopOnSignals();
  base::bootstrapIsThere = [] { return desktop::bus() != nullptr; };
  desktop::letScriptsFindRoles();
  return KVDMain();
}
