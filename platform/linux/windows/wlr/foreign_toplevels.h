// The windows that zwlr_foreign_toplevel_manager_v1 tells of, in the list of toplevels.h.
#pragma once

#include "platform/linux/windows/wayland/connection.h"
#include "platform/linux/windows/wayland/toplevels.h"

struct wl_seat;

namespace linux::windows::wlr {

/// Begins to listen.
void takeManager(const wayland::Offer& offer);
/// Ends that, and forgets all windows.
void dropManager();
/// Whether a compositor is followed that tells of windows.
bool hasManager();

/// Asks for the window to be in front of this seat.
void activate(const wayland::Toplevel& toplevel, wl_seat* seat);

}  // namespace linux::windows::wlr
