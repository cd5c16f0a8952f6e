// Keys by their names: the virtual key codes that the core presses, and the key texts of deeds.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

#include "platform/linux/xserver.h"

namespace desktop {

/// A key with the modifiers held meanwhile.
struct KeyStroke {
  std::uint32_t keysym = 0;
  std::uint16_t modifiers = kNoModifier;
};

/// The key with this virtual key code; 0 when it is not in the table.
std::uint32_t keysymOf(std::uint16_t virtualKey);

/// Reads "F5", "Shift+m", "Control+Escape": modifiers (Shift, Control, Alt) and a keysym's name without its
/// prefix, or one printable ASCII character. Nothing when the text is no such key.
std::optional<KeyStroke> parseKey(std::string_view text);

}  // namespace desktop
