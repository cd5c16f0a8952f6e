// COSMIC's compositor as a back end: windows and who is in front, outputs, and keys for the window in front.
// It is not asked to bring windows to the front.
#pragma once

#include "platform/linux/windows/backend.h"

namespace linux::windows::cosmic {

extern const Backend kBackend;

}  // namespace linux::windows::cosmic
