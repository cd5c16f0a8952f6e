// The sound keys, as a desktop honours those of a keyboard.
#pragma once

#include "platform/base/event_record.h"

namespace linux::sound {

/// Where a press leads from a volume in percent: 5 points on, a repeated one 2, within 0 and 100. What is
/// amplified becomes no louder, and is not turned down for that.
int volumeAfter(const base::SoundKey& key, int volume);

/// A press, repeated or not, steps the volume of the default sink; the louder key unmutes it too. The
/// desktop's on-screen display shows the volume then, where there is one that can be asked. A release does
/// nothing. Without a sound server nothing happens.
void pressSoundKey(const base::SoundKey& key);

}  // namespace linux::sound
