// Which virtual desktop KWin shows (org_kde_plasma_virtual_desktop_management).
#pragma once

#include <span>
#include <string>

#include "platform/linux/windows/wayland/connection.h"

namespace linux::windows::kwin {

/// Begins to listen.
void takeDesktops(const wayland::Offer& offer);
/// Ends that.
void dropDesktops();

/// Whether one of these is shown; true for none, which stand for all of them, and where KWin does not tell.
bool isAnyShown(std::span<const std::string> desktops);

}  // namespace linux::windows::kwin
