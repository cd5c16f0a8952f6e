// The window in which a program shows slides or photos.
#pragma once

#include <vector>

#include "platform/linux/programs/running.h"

namespace desktop {

/// The full-screen window of a program that is a show, and not its ordinary window made full screen; 0 when
/// there is none.
Window showWindow(const Instance& instance);

/// The windows with documents in them, topmost first: no dialogs, and none of another kind of document.
std::vector<Window> documentWindows(const Instance& instance);

}  // namespace desktop
