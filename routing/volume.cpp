#include "routing/volume.h"

#include <cstddef>
#include <cstring>

#include "adapters/lyrabox.h"
#include "adapters/spindle.h"
#include "adapters/vistremeplayer.h"
#include "adapters/vistremeplayerx.h"
#include "registry/bridge.h"
#include "registry/registry.h"
#include "routing/display.h"
#include "routing/retrigger.h"
#include "routing/target.h"

namespace {

/// The output volume at the last query, 0 to 100; kept as a record, nothing reads it.
std::int32_t sSystemVolume = -1;

constexpr std::int32_t kLastBelowMaximum = 99;

constexpr double kRepeatPeriod = 0.1;     // seconds
constexpr double kRepeatDuration = 10.0;  // seconds

/// Data words of the sound keys.
enum : std::uint32_t {
  kSoundUpPressed = 0x0A00,
  kSoundUpRepeated = 0x0A01,
  kSoundUpReleased = 0x0B00,
  kSoundDownPressed = 0x10A00,
  kSoundDownRepeated = 0x10A01,
  kSoundDownReleased = 0x10B00,
};

/// The event record of the window server, in the layout of a pointer of this size.
struct RecordLayout {
  std::uint32_t length;
  std::size_t lengthField;
  std::size_t type;
  std::size_t timeStamp;
  std::size_t flags;
  std::size_t subtype;
  std::size_t data;
};

constexpr RecordLayout kRecord = sizeof(void*) == 8 ? RecordLayout{240, 4, 8, 48, 56, 138, 140}
                                                    : RecordLayout{204, 4, 8, 28, 36, 110, 112};
constexpr std::uint32_t kSystemDefinedEvent = 14;
constexpr std::uint16_t kAuxiliaryControlButton = 8;

/// Writes a little-endian field.
template <typename T>
void Put(std::uint8_t* record, std::size_t offset, T value) {
  for (std::size_t i = 0; i < sizeof value; ++i)
    record[offset + i] = static_cast<std::uint8_t>(value >> (8 * i));
}

struct PlayerVolume {
  AppCode target;
  void (*raise)();
};

constexpr PlayerVolume kPlayerVolumes[] = {
    {App::Spin, DVDCommand_VolumeUp},
    {App::VstX, VistremeXCommand_VolumeUp},
    {App::Vist, VistremeCommand_VolumeUp},
    {App::Lyra, LyraboxCommand_VolumeUp},
};

void RaisePlayerVolume() {
  const AppCode target = targetApplication();
  for (const PlayerVolume& player : kPlayerVolumes) {
    if (target == player.target) return player.raise();
  }
}

std::int32_t QueryOutputVolume() {
  sSystemVolume =
      static_cast<std::int32_t>(HandleScriptWithIntegerResult("output volume of (get volume settings)"));
  return sSystemVolume;
}

void Repeat(UsageKey key, std::int32_t value) {
  if (sRetriggerTimer) return;
  const HIDEvent event{static_cast<std::uint16_t>(key >> 16), static_cast<std::uint16_t>(key), 0};
  retrigger(event, value, kRepeatPeriod, kRepeatDuration);
}

}  // namespace

bool dispatchVolumeEvent(PackedHIDEvent event, std::int32_t value) {
  void (*command)(std::int32_t) = nullptr;
  switch (UsageKeyOf(event)) {
    case Key::SystemMenuUp:
    case Key::VolumeIncrement:
      command = dispatchVolumeUpCommand;
      break;
    case Key::SystemMenuDown:
    case Key::VolumeDecrement:
      command = dispatchVolumeDownCommand;
      break;
    default:
      return false;
  }
  if (SpindleIsRunning() && targetApplication() == App::Spin) return false;
  if (LumbraIsRunning() && !AnyDisplayIsCaptured() && targetApplication() == App::Lumb) return false;
  command(value);
  return true;
}

void dispatchVolumeUpCommand(std::int32_t value) {
  const std::int32_t volume = QueryOutputVolume();
  if (value == 0) {
    dispatchSystemVolumeEvent(kSoundUpReleased);
    return;
  }
  if (volume <= kLastBelowMaximum) {
    dispatchSystemVolumeEvent(sRetriggerTimer ? kSoundUpRepeated : kSoundUpPressed);
  } else {
    if (HandleScriptWithIntegerResult("output muted of (get volume settings)") != 0) {
      HandleScript("set volume without output muted");
    }
    dispatchSystemVolumeEvent(kSoundUpPressed);
    RaisePlayerVolume();
  }
  // Whichever up key was pressed, the repeat is the Consumer page's.
  Repeat(Key::VolumeIncrement, value);
}

void dispatchVolumeDownCommand(std::int32_t value) {
  QueryOutputVolume();
  if (value == 0) {
    dispatchSystemVolumeEvent(kSoundDownReleased);
    return;
  }
  dispatchSystemVolumeEvent(sRetriggerTimer ? kSoundDownRepeated : kSoundDownPressed);
  Repeat(Key::VolumeDecrement, value);
}

int dispatchSystemVolumeEvent(std::uint32_t dataWord) {
  alignas(8) std::uint8_t record[kRecord.length];
  if (HostClearEventRecord(record, kRecord.length) != 0) return 0;
  Put(record, kRecord.timeStamp, std::uint64_t{0});
  Put(record, kRecord.flags, std::uint32_t{0xFFFFFFFF});
  Put(record, kRecord.type, kSystemDefinedEvent);
  Put(record, kRecord.subtype, kAuxiliaryControlButton);
  Put(record, kRecord.data, dataWord);
  std::uint32_t length = 0;
  std::memcpy(&length, record + kRecord.lengthField, sizeof length);
  return HostPostEventRecord(gKVDConnection, record, length, 0) == 0 ? 1 : 0;
}
