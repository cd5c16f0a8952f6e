// Key presses for one application.
#pragma once

#include <cstdint>

#include "platform/host.h"

/// Presses one key in the process of an application that the registry knows as running, with Shift held
/// around it where asked; does nothing when the application or its process is not found. `keyCode` is a
/// virtual key code. Takes 60 ms, 80 ms with Shift: the application sees a press of normal length.
void PostKeyEvent(HostStringRef bundleIdentifier, std::uint16_t keyCode, bool withShift);
