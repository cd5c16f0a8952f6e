// The professional photo application: no scripts, every action is a key press. A captured display means that
// its slideshow shows.
#pragma once

#include <cstdint>

/// Acts on a button; the value is non-zero when it was pressed. True when the button counts as one of the
/// professional photo application's; the event of no button at all does.
bool LumbraHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);

/// Ends a slideshow that shows.
void LumbraCommand_ExitSlideShow();
