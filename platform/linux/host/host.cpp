#include "platform/linux/host/host.h"

#include <utility>

#include "platform/base/port_names.h"
#include "platform/linux/roles/world.h"
#include "platform/linux/sound/sound.h"
#include "platform/linux/system/bus.h"
#include "platform/scripting/script.h"

namespace linux::host {

void init(std::vector<const windows::Backend*> backends, windows::Use use) {
  base::bootstrapIsThere = [] { return system::bus() != nullptr; };
  windows::init(std::move(backends), use);
  scripting::setHooks({.world = &roles::world(), .started = nullptr, .ended = nullptr});
}

void finish() {
  scripting::setHooks({});
  sound::finish();
  windows::finish();
  system::closeBus();
  base::bootstrapIsThere = nullptr;
}

}  // namespace linux::host
