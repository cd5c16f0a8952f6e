// The operations of the host interface by which a button does something, in the place of the desktop's own:
// they write it down and do nothing.

#include "platform/base/event_record.h"
#include "platform/base/object.h"
#include "platform/base/values.h"
#include "platform/host.h"
#include "platform/linux/host/key_events.h"
#include "platform/linux/sound/sound.h"
#include "platform/linux/sound/sound_keys.h"
#include "report/deeds.h"

namespace {

namespace programs = linux::programs;

constexpr std::int32_t kParameterError = -50;
constexpr std::int32_t kNoSuchProcess = -600;

std::string pressed(const base::SoundKey& key) {
  const auto sound = linux::sound::soundState();
  if (!sound) return "sound key, but no sound server answers";
  std::string words = "output volume from " + std::to_string(sound->volume) + " to " +
                      std::to_string(linux::sound::volumeAfter(key, sound->volume));
  if (linux::sound::volumeAfter(key, sound->volume) == sound->volume) {
    words = "output volume stays at " + std::to_string(sound->volume);
  }
  return key.louder && sound->muted ? words + ", no longer muted" : words;
}

}  // namespace

void HostPostEventToProcess(const HostProcessSerialNumber& process, HostKeyEventRef event) {
  const auto* const key = base::as<linux::host::KeyEvent>(event);
  const programs::Instance* const instance = programs::findInstance(process);
  if (key == nullptr || instance == nullptr) return;
  if (key->virtualKey == HostVirtualKey::Shift) {
    key->source->shiftIsDown = key->down;
  } else if (key->down) {
    report::noteKey(*instance, key->virtualKey, key->source->shiftIsDown);
  }
}

std::int32_t HostPostEventRecord(HostConnectionID connection, const void* record, std::uint32_t length,
                                 std::int32_t) {
  if (connection == 0 || record == nullptr || !base::isEventRecordLength(length)) return kParameterError;
  const auto key = base::soundKeyIn(record);
  if (key && key->pressed) report::note({programs::Role::None, "the desktop", 0, pressed(*key), {}});
  return 0;
}

std::int32_t HostSendEvent(const HostEventDescriptor* event, HostEventDescriptor*, std::int32_t,
                           std::int32_t) {
  const auto target = base::targetOf(event);
  if (!target) return kParameterError;
  const programs::Instance* const instance = programs::findInstance(*target);
  if (instance == nullptr) return kNoSuchProcess;
  const programs::Instance* const first = programs::firstInstance(instance->role);
  report::noteFor(first != nullptr ? *first : *instance, "come to the front", 0);
  return 0;
}
