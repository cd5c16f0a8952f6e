// The protocol of i3 and sway: what the compositor tells of windows to whoever asks.
#pragma once

#include <sys/types.h>

#include <string_view>
#include <vector>

#include "platform/base/deadline.h"
#include "platform/linux/windows/wlr/container.h"

namespace linux::windows::wlr {

/// Asks the compositor with this process for its windows. None where it does not speak the protocol or does
/// not answer in time.
std::vector<Container> askSway(pid_t compositor, const base::Deadline& deadline);

/// The windows in an answer in JSON, in the order in which they were opened; none when it is no such answer.
std::vector<Container> swayWindowsIn(std::string_view tree);

}  // namespace linux::windows::wlr
