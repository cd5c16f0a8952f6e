// The window server's side of the host interface: sound keys, keys for one process, displays.

#include <algorithm>
#include <sstream>
#include <string>

#include "platform/base/event_record.h"
#include "platform/base/values.h"
#include "platform/host.h"
#include "platform/stage/desktop.h"
#include "platform/stage/journal.h"

namespace {

using stage::Entry;
using stage::record;

constexpr HostConnectionID kConnection = 1;

/// What one sound key adds to the output volume.
constexpr int kVolumeStep = 5;

struct EventSource final : HostObject {
  static constexpr base::Kind kKind = base::Kind::EventSource;
  EventSource() : HostObject(kKind) {}
};

struct KeyEvent final : HostObject {
  static constexpr base::Kind kKind = base::Kind::KeyEvent;
  KeyEvent(std::uint16_t key, bool isDown) : HostObject(kKind), virtualKey(key), down(isDown) {}
  const std::uint16_t virtualKey;
  const bool down;
};

void pressSoundKey(const base::SoundKey& key) {
  record(Entry::SoundKey, std::string("sound key ") + (key.louder ? "up" : "down") +
                              (key.pressed ? " pressed" : " released") + (key.repeated ? ", repeated" : ""));
  if (!key.pressed) return;
  stage::setOutputVolume(stage::desktop().outputVolume + (key.louder ? kVolumeStep : -kVolumeStep));
}

}  // namespace

HostConnectionID HostConnectWindowServer() {
  const bool up = !stage::desktop().broken.windowServer;
  record(Entry::Service, up ? "connects to the window server" : "finds no window server");
  return up ? kConnection : 0;
}

std::int32_t HostSetLocalEventsSuppressionInterval(HostConnectionID connection, double seconds) {
  if (connection != kConnection) return -1;
  std::ostringstream text;
  text << "holds the user's own input back for " << seconds << " s after a synthetic event";
  record(Entry::Service, text.str());
  return 0;
}

std::int32_t HostClearEventRecord(void* eventRecord, std::uint32_t length) {
  return base::clearEventRecord(eventRecord, length) ? 0 : -1;
}

std::int32_t HostPostEventRecord(HostConnectionID connection, const void* eventRecord, std::uint32_t length,
                                 std::int32_t) {
  if (connection != kConnection || eventRecord == nullptr || !base::isEventRecordLength(length)) return -1;
  if (stage::desktop().broken.eventRecords) return -1;
  if (const auto key = base::soundKeyIn(eventRecord)) pressSoundKey(*key);
  return 0;
}

HostEventSourceRef HostCreatePrivateEventSource() { return HostEventSourceRef(new EventSource()); }

HostKeyEventRef HostCreateKeyboardEvent(HostEventSourceRef source, std::uint16_t virtualKey, bool down) {
  if (!source) return nullptr;
  return HostKeyEventRef(new KeyEvent(virtualKey, down));
}

void HostPostEventToProcess(const HostProcessSerialNumber& serialNumber, HostKeyEventRef event) {
  const auto* const key = base::as<KeyEvent>(event);
  const stage::Process* const process = stage::findProcess(serialNumber);
  if (key == nullptr || process == nullptr) return;
  record(Entry::Key, "key " + std::to_string(key->virtualKey) +
                         (key->down ? " pressed in " : " released in ") + process->application->name);
  static bool sShiftIsDown = false;
  if (key->virtualKey == HostVirtualKey::Shift) {
    sShiftIsDown = key->down;
  } else if (key->down) {
    process->application->receiveKey(key->virtualKey, sShiftIsDown);
  }
}

std::int32_t HostFindProcessByBundleIdentifier(HostStringRef bundleIdentifier, std::uint32_t,
                                               HostProcessSerialNumber* serialNumber, std::uint8_t* found) {
  *found = 0;
  if (stage::desktop().broken.processLookUp) return -1;
  for (const stage::Process& process : stage::desktop().running) {
    if (process.application->identifier != base::textOf(bundleIdentifier)) continue;
    *serialNumber = process.serialNumber;
    *found = 1;
    break;
  }
  return 0;
}

std::int32_t HostGetActiveDisplayList(std::uint32_t capacity, HostDisplayID* displays, std::uint32_t* count) {
  *count = 0;
  for (const stage::Display& display : stage::desktop().displays) {
    if (*count == capacity) break;
    displays[(*count)++] = display.id;
  }
  // What a failure leaves behind is not to be looked at.
  return stage::desktop().broken.displayQuery ? -1 : 0;
}

std::uint32_t HostDisplayIsCaptured(HostDisplayID id) {
  const auto& displays = stage::desktop().displays;
  const bool isCaptured = std::any_of(displays.begin(), displays.end(), [&](const stage::Display& display) {
    return display.id == id && display.captured();
  });
  return isCaptured ? 1 : 0;
}
