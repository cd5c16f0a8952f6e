// The windows that ext_foreign_toplevel_list_v1 and zcosmic_toplevel_info_v1 tell of together, in the list of
// toplevels.h.
#pragma once

#include "platform/linux/windows/wayland/connection.h"

namespace linux::windows::cosmic {

/// Note what is offered, without accepting it yet.
void noteList(const wayland::Offer& offer);
void noteInfo(const wayland::Offer& offer);

/// Begins to listen, where both are offered.
void beginInfo();
/// Ends that, and forgets all windows.
void endInfo();
/// Whether a compositor is followed that tells of windows.
bool hasInfo();

}  // namespace linux::windows::cosmic
