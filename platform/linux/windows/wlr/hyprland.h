// The language of Hyprland: a question in words, answered in JSON.
#pragma once

#include <sys/types.h>

#include <string_view>
#include <vector>

#include "platform/base/deadline.h"
#include "platform/linux/windows/wlr/container.h"

namespace linux::windows::wlr {

/// Asks the compositor with this process for its windows. None where it does not speak the language or does
/// not answer in time.
std::vector<Container> askHyprland(pid_t compositor, const base::Deadline& deadline);

/// The windows in the answers to "clients" and "monitors"; none when they are no such answers.
std::vector<Container> hyprlandWindowsIn(std::string_view clients, std::string_view monitors);

}  // namespace linux::windows::wlr
