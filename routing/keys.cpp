#include "routing/keys.h"

#include "registry/registry.h"

namespace {

constexpr std::uint32_t kFindRunningProcess = 1;

constexpr std::uint32_t kHeldTime = 50'000;   // microseconds
constexpr std::uint32_t kPauseTime = 10'000;  // microseconds

/// Made at the first key and kept for the daemon's life.
HostEventSourceRef sEventSource;

void Post(const HostProcessSerialNumber& process, std::uint16_t keyCode, bool down,
          std::uint32_t microseconds) {
  const HostKeyEventRef event = HostCreateKeyboardEvent(sEventSource, keyCode, down);
  HostPostEventToProcess(process, event);
  HostSleepMicroseconds(microseconds);
  HostRelease(event);
}

}  // namespace

void PostKeyEvent(HostStringRef bundleIdentifier, std::uint16_t keyCode, bool withShift) {
  HostProcessSerialNumber process;
  if (HostExtractSerialNumberParts(getASNForBundleID(bundleIdentifier), &process.high, &process.low) == 0)
    return;
  if (!sEventSource) sEventSource = HostCreatePrivateEventSource();
  std::uint8_t found = 0;
  if (HostFindProcessByBundleIdentifier(bundleIdentifier, kFindRunningProcess, &process, &found) != 0) return;
  if (found == 0) return;

  if (withShift) Post(process, HostVirtualKey::Shift, true, kPauseTime);
  Post(process, keyCode, true, kHeldTime);
  Post(process, keyCode, false, kPauseTime);
  if (withShift) Post(process, HostVirtualKey::Shift, false, kPauseTime);
}
