// The windows that KWin tells of to programs that a desktop entry lets (org_kde_plasma_window_management).
#pragma once

#include "platform/linux/windows/kwin/source.h"
#include "platform/linux/windows/wayland/connection.h"

namespace linux::windows::kwin {

/// Begins to listen.
void takeManager(const wayland::Offer& offer);
/// Ends that, and forgets all windows.
void dropManager();
bool hasManager();

/// The windows that a person may have opened: panels and the like are left out.
extern const Source kPlasma;

}  // namespace linux::windows::kwin
