// The window server's side of the host interface that asks: the connection, processes, displays.

#include <algorithm>
#include <vector>

#include "platform/base/event_record.h"
#include "platform/base/values.h"
#include "platform/host.h"
#include "platform/linux/programs/running.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/windows/windows.h"

namespace {

namespace programs = linux::programs;
namespace windows = linux::windows;

constexpr HostConnectionID kConnection = 1;
constexpr std::int32_t kFailed = -1;
constexpr std::int32_t kParameterError = -50;

}  // namespace

HostConnectionID HostConnectWindowServer() {
  return linux::system::bus() != nullptr || windows::isOpen() ? kConnection : 0;
}

std::int32_t HostSetLocalEventsSuppressionInterval(HostConnectionID connection, double) {
  // A key for one window never holds back the person's own.
  return connection == kConnection ? 0 : kFailed;
}

std::int32_t HostClearEventRecord(void* record, std::uint32_t length) {
  return base::clearEventRecord(record, length) ? 0 : kParameterError;
}

std::int32_t HostFindProcessByBundleIdentifier(HostStringRef bundleIdentifier, std::uint32_t,
                                               HostProcessSerialNumber* process, std::uint8_t* found) {
  *found = 0;
  programs::takeInDesktop();
  const programs::Role role = programs::roleOf(base::textOf(bundleIdentifier));
  const programs::Instance* const first = programs::firstInstance(role);
  if (first == nullptr) return 0;
  *process = first->serialNumber;
  *found = 1;
  return 0;
}

std::int32_t HostGetActiveDisplayList(std::uint32_t capacity, HostDisplayID* displays, std::uint32_t* count) {
  *count = 0;
  programs::takeInDesktop();
  const std::vector<windows::Output> outputs = windows::outputs();
  if (outputs.empty()) return kFailed;
  *count = static_cast<std::uint32_t>(std::min<std::size_t>(capacity, outputs.size()));
  std::transform(outputs.begin(), outputs.begin() + *count, displays,
                 [](const windows::Output& output) { return output.id; });
  return 0;
}

std::uint32_t HostDisplayIsCaptured(HostDisplayID display) { return windows::isCaptured(display) ? 1 : 0; }
