#include "platform/linux/sound/sound_keys.h"

#include <algorithm>
#include <cstdint>

#include "platform/linux/sound/sound.h"
#include "platform/linux/system/bus.h"

namespace linux::sound {

namespace {

// Points of the volume in percent. A held key is repeated ten times a second: it must be possible to stop it
// where one wants.
constexpr int kStep = 5;
constexpr int kRepeatedStep = 2;
constexpr int kFullVolume = 100;

const char* iconOf(const SoundState& sound) {
  if (sound.muted || sound.volume == 0) return "audio-volume-muted-symbolic";
  if (sound.volume <= 33) return "audio-volume-low-symbolic";
  return sound.volume <= 66 ? "audio-volume-medium-symbolic" : "audio-volume-high-symbolic";
}

/// From version 41 on it obeys its own settings daemon alone and answers others with an error, which nobody
/// waits for.
bool showOnGnome(const SoundState& sound) {
  constexpr char kName[] = "org.gnome.Shell";
  if (!system::nameHasOwner(kName)) return false;
  return system::send({kName}, {"/org/gnome/Shell", kName, "ShowOSD"}, "a{sv}", 2, "icon", "s", iconOf(sound),
                      "level", "d", sound.muted ? 0.0 : sound.volume / 100.0);
}

/// It shows 0 as muted.
bool showOnPlasma(const SoundState& sound) {
  constexpr char kName[] = "org.kde.plasmashell";
  if (!system::nameHasOwner(kName)) return false;
  return system::send({kName}, {"/org/kde/osdService", "org.kde.osdService", "volumeChanged"}, "i",
                      std::int32_t{sound.muted ? 0 : sound.volume});
}

}  // namespace

int volumeAfter(const base::SoundKey& key, int volume) {
  const int step = key.repeated ? kRepeatedStep : kStep;
  if (!key.louder) return std::max(volume - step, 0);
  return std::max(volume, std::min(volume + step, kFullVolume));
}

void pressSoundKey(const base::SoundKey& key) {
  if (!key.pressed) return;
  auto sound = soundState();
  if (!sound) return;
  const int volume = volumeAfter(key, sound->volume);
  if (volume != sound->volume && !setOutputVolume(volume)) return;
  sound->volume = volume;
  if (key.louder && sound->muted && setOutputMuted(false)) sound->muted = false;
  if (!showOnGnome(*sound)) showOnPlasma(*sound);
}

}  // namespace linux::sound
