// The window server's side of the host interface: the connection, keys for one process, displays.

#include <algorithm>
#include <vector>

#include "platform/base/object.h"
#include "platform/base/values.h"
#include "platform/host.h"
#include "platform/linux/programs/running.h"
#include "platform/linux/roles/posted_keys.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/windows/keysyms.h"
#include "platform/linux/windows/windows.h"

namespace {

namespace programs = linux::programs;
namespace roles = linux::roles;
namespace windows = linux::windows;

constexpr HostConnectionID kConnection = 1;
constexpr std::int32_t kFailed = -1;

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

HostConnectionID HostConnectWindowServer() {
  return linux::system::bus() != nullptr || windows::isOpen() ? kConnection : 0;
}

std::int32_t HostSetLocalEventsSuppressionInterval(HostConnectionID connection, double) {
  // A key for one window never holds back the person's own.
  return connection == kConnection ? 0 : kFailed;
}

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

std::int32_t HostFindProcessByBundleIdentifier(HostStringRef bundleIdentifier, std::uint32_t,
                                               HostProcessSerialNumber* process, std::uint8_t* found) {
  *found = 0;
  programs::takeInDesktop();
  const programs::Role role = programs::roleOf(base::textOf(bundleIdentifier));
  const programs::Instance* const first = programs::firstInstance(role);
  if (first == nullptr) return 0;
  *process = first->serialNumber;
  *found = 1;
  return 0;
}

std::int32_t HostGetActiveDisplayList(std::uint32_t capacity, HostDisplayID* displays, std::uint32_t* count) {
  *count = 0;
  programs::takeInDesktop();
  const std::vector<windows::Output> outputs = windows::outputs();
  if (outputs.empty()) return kFailed;
  *count = static_cast<std::uint32_t>(std::min<std::size_t>(capacity, outputs.size()));
  std::transform(outputs.begin(), outputs.begin() + *count, displays,
                 [](const windows::Output& output) { return output.id; });
  return 0;
}

std::uint32_t HostDisplayIsCaptured(HostDisplayID display) { return windows::isCaptured(display) ? 1 : 0; }
