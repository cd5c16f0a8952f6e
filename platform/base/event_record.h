// The window server's event records, as bytes at fixed offsets, and the sound keys in them.
#pragma once

#include <cstdint>
#include <optional>

namespace base {

/// A sound key as its data word tells it: key << 16 | state << 8 | repeat.
struct SoundKey {
  /// The key that makes it louder; else the one that makes it quieter.
  bool louder = false;
  bool pressed = false;
  bool repeated = false;
};

/// Clears a record and writes its length into it. False where the length has no room.
bool clearEventRecord(void* record, std::uint32_t length);

/// Whether this is the length of an event record.
bool isEventRecordLength(std::uint32_t length);

/// The sound key in a record of that length; nothing in every other record.
std::optional<SoundKey> soundKeyIn(const void* record);

}  // namespace base
