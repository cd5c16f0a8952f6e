// The X server as a back end: windows and who is in front (Extended Window Manager Hints 1.5), outputs, and
// keys for one window.
//
// The connection is made when it is first needed and made again, at most once a turn of the run loop, after
// it was lost.
#pragma once

#include "platform/linux/windows/backend.h"

namespace linux::windows::x11 {

extern const Backend kBackend;

}  // namespace linux::windows::x11
