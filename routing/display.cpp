#include "routing/display.h"

#include <algorithm>
#include <cstdint>

#include "platform/host.h"

namespace {

/// Displays beyond these are never examined.
constexpr std::uint32_t kMostDisplays = 8;

}  // namespace

bool AnyDisplayIsCaptured() {
  HostDisplayID displays[kMostDisplays] = {};
  std::uint32_t count = 0;
  if (HostGetActiveDisplayList(kMostDisplays, displays, &count) != 0) return false;
  return std::any_of(displays, displays + std::min(count, kMostDisplays),
                     [](HostDisplayID display) { return HostDisplayIsCaptured(display) != 0; });
}
