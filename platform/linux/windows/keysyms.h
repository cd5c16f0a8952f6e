// Keys by their names: the virtual key codes that the core presses, and the key texts of the programs' table.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

#include "platform/linux/windows/backend.h"

namespace linux::windows {

/// A key, an X keysym, with the modifiers held meanwhile.
struct KeyStroke {
  std::uint32_t keysym = 0;
  Modifiers modifiers = kNoModifier;
};

/// The key with this virtual key code; 0 when it is not in the table.
std::uint32_t keysymOf(std::uint16_t virtualKey);

/// Reads "F5", "Shift+m", "Control+Escape": modifiers (Shift, Control, Alt) and a keysym's name without its
/// prefix, or one printable ASCII character. Nothing when the text is no such key.
std::optional<KeyStroke> parseKey(std::string_view text);

}  // namespace linux::windows
