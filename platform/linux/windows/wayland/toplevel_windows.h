// The windows of toplevels.h as a back end tells of them.
#pragma once

#include <cstdint>

#include "platform/linux/windows/backend.h"
#include "platform/linux/windows/wayland/toplevels.h"

namespace linux::windows::wayland {

/// As it was last described.
Window windowOf(const Toplevel& toplevel, const Backend& backend);

/// The same as look() of a back end wants it: who is active stays as it was. False when the window has gone,
/// which is shown no longer then.
bool lookAgain(Window& window);

/// Types into the window if it is in front; a release is owed whoever is there.
bool sendKey(std::uint64_t window, std::uint32_t keysym, bool down, Modifiers modifiers);

}  // namespace linux::windows::wayland
