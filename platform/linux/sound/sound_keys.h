// The sound keys, as a desktop honours those of a keyboard.
#pragma once

#include "platform/base/event_record.h"

namespace linux::sound {

/// A press, repeated or not, steps the volume of the default sink by 5 points within 0 and 100; the louder
/// key unmutes it too. The desktop's on-screen display shows the volume then, where there is one that can be
/// asked. A release does nothing. Without a sound server nothing happens.
void pressSoundKey(const base::SoundKey& key);

}  // namespace linux::sound
