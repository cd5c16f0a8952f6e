// The compositor's outputs.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

#include "platform/linux/windows/wayland/connection.h"
#include "platform/linux/windows/window.h"

struct wl_output;

namespace linux::windows::wayland {

void addOutput(const Offer& offer);
/// Nothing happens when the number is no output's.
void removeOutput(std::uint32_t name);
void forgetOutputs();

/// Those whose size is known, side by side in the order in which they came: compositors tell no position that
/// could be relied on, and all that counts is which of them a window covers.
std::vector<Output> outputs();

/// What these outputs take up of that row; nothing when there are none.
Area areaOf(std::span<wl_output* const> entered);
/// The same for the output with this name, as "HDMI-A-1".
Area areaOf(std::string_view name);
/// The same for the output whose upper left corner is there in the compositor's own space.
Area areaAt(int x, int y);

}  // namespace linux::windows::wayland
