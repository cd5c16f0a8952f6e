// Compositors of wlroots and those that speak as they do (sway, labwc, Hyprland, Wayfire, river, niri) as a
// back end: windows and who is in front, outputs, and keys for the window in front.
//
// No compositor tells the order of windows: it is the one in which they were last in front.
#pragma once

#include "platform/linux/windows/backend.h"

namespace linux::windows::wlr {

extern const Backend kBackend;

}  // namespace linux::windows::wlr
