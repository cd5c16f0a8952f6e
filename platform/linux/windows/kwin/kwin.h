// KWin, the compositor of Plasma, as a back end: windows and who is in front, outputs, and keys for the
// window in front.
#pragma once

#include "platform/linux/windows/backend.h"

namespace linux::windows::kwin {

extern const Backend kBackend;

}  // namespace linux::windows::kwin
