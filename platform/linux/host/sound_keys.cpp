// Event records: the sound keys are the only ones that kvd posts.

#include "platform/linux/sound/sound_keys.h"
#include "platform/base/event_record.h"
#include "platform/host.h"

namespace {

constexpr std::int32_t kParameterError = -50;

}  // namespace

std::int32_t HostPostEventRecord(HostConnectionID connection, const void* record, std::uint32_t length,
                                 std::int32_t) {
  if (connection == 0 || record == nullptr || !base::isEventRecordLength(length)) return kParameterError;
  if (const auto key = base::soundKeyIn(record)) linux::sound::pressSoundKey(*key);
  return 0;
}
