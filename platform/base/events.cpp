#include "platform/base/values.h"

#include <cstring>

using base::EventContents;

namespace {

constexpr std::int16_t kParameterError = -50;
/// The type of a descriptor that is an event itself: 'tevt'.
constexpr std::uint32_t kEventType = 0x74657674;

/// Makes up return ids: 1, 2, … and round again, never 0 or −1.
std::int16_t nextReturnID() {
  static std::int16_t last = 0;
  last = static_cast<std::int16_t>(last % INT16_MAX + 1);
  return last;
}

}  // namespace

std::int16_t HostCreateDescriptor(std::uint32_t type, const void* data, std::size_t size,
                                  HostEventDescriptor* descriptor) {
  if (descriptor == nullptr || (data == nullptr && size > 0)) return kParameterError;
  auto* contents = new EventContents;
  contents->type = type;
  if (size > 0) contents->data.assign(static_cast<const char*>(data), size);
  *descriptor = {type, contents};
  return 0;
}

std::int16_t HostCreateEvent(std::uint32_t eventClass, std::uint32_t eventID,
                             const HostEventDescriptor* target, std::int16_t returnID,
                             std::int32_t transactionID, HostEventDescriptor* event) {
  const auto* address = target != nullptr ? base::as<EventContents>(target->contents) : nullptr;
  if (event == nullptr || address == nullptr || address->isEvent) return kParameterError;
  auto* contents = new EventContents;
  contents->type = address->type;
  contents->data = address->data;
  contents->isEvent = true;
  contents->eventClass = eventClass;
  contents->eventID = eventID;
  contents->returnID = returnID == -1 ? nextReturnID() : returnID;
  contents->transactionID = transactionID;
  *event = {kEventType, contents};
  return 0;
}

std::optional<HostProcessSerialNumber> base::targetOf(const HostEventDescriptor* event) {
  const auto* contents = event != nullptr ? base::as<EventContents>(event->contents) : nullptr;
  HostProcessSerialNumber target;
  if (contents == nullptr || !contents->isEvent || contents->data.size() != sizeof target)
    return std::nullopt;
  std::memcpy(&target, contents->data.data(), sizeof target);
  return target;
}

std::int16_t HostDisposeDescriptor(HostEventDescriptor* descriptor) {
  if (descriptor == nullptr) return kParameterError;
  HostRelease(descriptor->contents);
  *descriptor = {};
  return 0;
}
