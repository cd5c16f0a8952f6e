// Keys for one process, as the host interface posts them.

#include "platform/host.h"
#include "platform/linux/host/key_events.h"
#include "platform/linux/programs/running.h"
#include "platform/linux/roles/posted_keys.h"

namespace programs = linux::programs;
namespace roles = linux::roles;

void HostPostEventToProcess(const HostProcessSerialNumber& process, HostKeyEventRef event) {
  const auto* const key = base::as<linux::host::KeyEvent>(event);
  const programs::Instance* const instance = programs::findInstance(process);
  if (key == nullptr || instance == nullptr) return;
  linux::host::EventSource& source = *key->source;
  if (key->virtualKey == HostVirtualKey::Shift) {
    source.shiftIsDown = key->down;
  } else if (key->down) {
    source.pressedIn = roles::pressKey(roles::Performer(*instance), key->virtualKey, source.modifiers());
  } else {
    roles::releaseKey(source.pressedIn, key->virtualKey, source.modifiers());
    source.pressedIn = {};
  }
}
