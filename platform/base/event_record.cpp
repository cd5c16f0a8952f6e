#include "platform/base/event_record.h"

#include <cstddef>
#include <cstring>

namespace base {

namespace {

/// The layout of a pointer of this size; all fields are little-endian.
struct Layout {
  std::uint32_t length;
  std::size_t lengthField;
  std::size_t type;
  std::size_t subtype;
  std::size_t data;
};

constexpr Layout kLayout = sizeof(void*) == 8 ? Layout{240, 4, 8, 138, 140} : Layout{204, 4, 8, 110, 112};

constexpr std::uint32_t kSystemDefined = 14;
constexpr std::uint32_t kAuxiliaryControlButton = 8;

constexpr std::uint32_t kSoundUp = 0;
constexpr std::uint32_t kSoundDown = 1;
constexpr std::uint32_t kKeyDown = 0x0A;

std::uint32_t fieldAt(const void* record, std::size_t offset, std::size_t width) {
  const auto* bytes = static_cast<const std::uint8_t*>(record) + offset;
  std::uint32_t value = 0;
  for (std::size_t i = width; i-- > 0;) value = value << 8 | bytes[i];
  return value;
}

}  // namespace

bool clearEventRecord(void* record, std::uint32_t length) {
  if (record == nullptr || length < kLayout.lengthField + sizeof length) return false;
  std::memset(record, 0, length);
  std::memcpy(static_cast<std::uint8_t*>(record) + kLayout.lengthField, &length, sizeof length);
  return true;
}

bool isEventRecordLength(std::uint32_t length) { return length == kLayout.length; }

std::optional<SoundKey> soundKeyIn(const void* record) {
  if (fieldAt(record, kLayout.type, 4) != kSystemDefined) return std::nullopt;
  if (fieldAt(record, kLayout.subtype, 2) != kAuxiliaryControlButton) return std::nullopt;
  const std::uint32_t word = fieldAt(record, kLayout.data, 4);
  const std::uint32_t key = word >> 16;
  if (key != kSoundUp && key != kSoundDown) return std::nullopt;
  return SoundKey{key == kSoundUp, (word >> 8 & 0xFF) == kKeyDown, (word & 1) != 0};
}

}  // namespace base
