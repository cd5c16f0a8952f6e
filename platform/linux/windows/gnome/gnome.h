// GNOME Shell on Wayland, which tells nobody of windows: an extension of its own does, else accessibility;
// keys go through the shell's remote desktop.
#pragma once

#include "platform/linux/windows/backend.h"

namespace linux::windows::gnome {

extern const Backend kBackend;

}  // namespace linux::windows::gnome
