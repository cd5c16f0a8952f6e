// The window server's side of the host interface: sound keys, keys for one process, displays.

#include <algorithm>
#include <cstring>
#include <string>

#include "platform/base/values.h"
#include "platform/host.h"
#include "platform/stage/desktop.h"
#include "platform/stage/journal.h"
#include "platform/stage/virtual_keys.h"

namespace {

using stage::Entry;
using stage::record;

constexpr HostConnectionID kConnection = 1;

// The event record, by byte offsets.
constexpr std::uint32_t kRecordLength = 240;
constexpr std::size_t kLengthOffset = 4;
constexpr std::size_t kTypeOffset = 8;
constexpr std::size_t kSubtypeOffset = 138;
constexpr std::size_t kDataOffset = 140;

constexpr std::uint32_t kSystemDefined = 14;
constexpr std::uint16_t kAuxiliaryControlButton = 8;
constexpr std::uint32_t kSoundDownKey = 1;
constexpr std::uint32_t kKeyDown = 0x0A;

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

template <typename T>
T fieldAt(const void* data, std::size_t offset) {
  T value;
  std::memcpy(&value, static_cast<const std::byte*>(data) + offset, sizeof value);
  return value;
}

void pressSoundKey(std::uint32_t data) {
  const std::uint32_t key = data >> 16;
  const bool down = (data >> 8 & 0xFF) == kKeyDown;
  const bool repeated = (data & 1) != 0;
  if (key > kSoundDownKey) return;
  record(Entry::SoundKey, std::string("sound key ") + (key == kSoundDownKey ? "down" : "up") +
                              (down ? " pressed" : " released") + (repeated ? ", repeated" : ""));
  if (!down) return;
  stage::setOutputVolume(stage::desktop().outputVolume + (key == kSoundDownKey ? -kVolumeStep : kVolumeStep));
}

}  // namespace

HostConnectionID HostConnectWindowServer() {
  const bool up = !stage::desktop().broken.windowServer;
  record(Entry::Service, up ? "connects to the window server" : "finds no window server");
  return up ? kConnection : 0;
}

std::int32_t HostSetLocalEventsSuppressionInterval(HostConnectionID connection, double seconds) {
  if (connection != kConnection) return -1;
  record(Entry::Service, "holds the user's own input back for " + std::to_string(static_cast<int>(seconds)) +
                             " s after a synthetic event");
  return 0;
}

std::int32_t HostClearEventRecord(void* eventRecord, std::uint32_t length) {
  if (eventRecord == nullptr || length < kLengthOffset + sizeof length) return -1;
  std::memset(eventRecord, 0, length);
  std::memcpy(static_cast<std::byte*>(eventRecord) + kLengthOffset, &length, sizeof length);
  return 0;
}

std::int32_t HostPostEventRecord(HostConnectionID connection, const void* eventRecord, std::uint32_t length,
                                 std::int32_t) {
  if (connection != kConnection || eventRecord == nullptr || length != kRecordLength) return -1;
  if (stage::desktop().broken.eventRecords) return -1;
  if (fieldAt<std::uint32_t>(eventRecord, kTypeOffset) == kSystemDefined &&
      fieldAt<std::uint16_t>(eventRecord, kSubtypeOffset) == kAuxiliaryControlButton) {
    pressSoundKey(fieldAt<std::uint32_t>(eventRecord, kDataOffset));
  }
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
  if (key->virtualKey == stage::keys::kShift) {
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
  if (stage::desktop().broken.displayQuery) return -1;
  for (const stage::Display& display : stage::desktop().displays) {
    if (*count == capacity) break;
    displays[(*count)++] = display.id;
  }
  return 0;
}

std::uint32_t HostDisplayIsCaptured(HostDisplayID id) {
  const auto& displays = stage::desktop().displays;
  return std::any_of(displays.begin(), displays.end(),
                     [&](const stage::Display& display) { return display.id == id && display.captured(); });
}
