#include "platform/linux/host/key_events.h"

#include "platform/host.h"

using linux::host::EventSource;
using linux::host::KeyEvent;

HostEventSourceRef HostCreatePrivateEventSource() { return HostEventSourceRef(new EventSource()); }

HostKeyEventRef HostCreateKeyboardEvent(HostEventSourceRef source, std::uint16_t virtualKey, bool down) {
  auto* const from = base::as<EventSource>(source);
  return from != nullptr ? HostKeyEventRef(new KeyEvent(from, virtualKey, down)) : nullptr;
}
