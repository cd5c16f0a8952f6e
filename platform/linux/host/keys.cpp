// Keys for one process, as the host interface posts them.

#include "platform/base/object.h"
#include "platform/host.h"
#include "platform/linux/programs/running.h"
#include "platform/linux/roles/posted_keys.h"
#include "platform/linux/windows/keysyms.h"
#include "platform/linux/windows/window.h"

namespace {

namespace programs = linux::programs;
namespace roles = linux::roles;
namespace windows = linux::windows;

/// Key state of its own: what the person holds down on the keyboard does not count.
struct EventSource final : HostObject {
  static constexpr base::Kind kKind = base::Kind::EventSource;
  EventSource() : HostObject(kKind) {}
  bool shiftIsDown = false;
  /// The window that took the last press and is owed the release; by then another may be the right one.
  windows::ID pressedIn;

  windows::Modifiers modifiers() const { return shiftIsDown ? windows::kShift : windows::kNoModifier; }
};

struct KeyEvent final : HostObject {
  static constexpr base::Kind kKind = base::Kind::KeyEvent;
  KeyEvent(EventSource* from, std::uint16_t key, bool isDown)
      : HostObject(kKind), source(base::retained(from)), virtualKey(key), down(isDown) {}
  const base::Owned<EventSource> source;
  const std::uint16_t virtualKey;
  const bool down;
};

}  // namespace

HostEventSourceRef HostCreatePrivateEventSource() { return HostEventSourceRef(new EventSource()); }

HostKeyEventRef HostCreateKeyboardEvent(HostEventSourceRef source, std::uint16_t virtualKey, bool down) {
  auto* const from = base::as<EventSource>(source);
  return from != nullptr ? HostKeyEventRef(new KeyEvent(from, virtualKey, down)) : nullptr;
}

void HostPostEventToProcess(const HostProcessSerialNumber& process, HostKeyEventRef event) {
  const auto* const key = base::as<KeyEvent>(event);
  const programs::Instance* const instance = programs::findInstance(process);
  if (key == nullptr || instance == nullptr) return;
  EventSource& source = *key->source;
  if (key->virtualKey == HostVirtualKey::Shift) {
    source.shiftIsDown = key->down;
  } else if (key->down) {
    source.pressedIn = roles::pressKey(roles::Performer(*instance), key->virtualKey, source.modifiers());
  } else {
    roles::releaseKey(source.pressedIn, key->virtualKey, source.modifiers());
    source.pressedIn = {};
  }
}
