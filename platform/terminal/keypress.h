// One key of the keyboard.
#pragma once

namespace terminal {

/// The keys that are no characters, as far as they mean something here.
enum class Special { None, Up, Down, Left, Right, Enter, Escape, Backspace, PageUp, PageDown, Other };

struct Keypress {
  wchar_t character = 0;  ///< 0 for a key that is none
  Special special = Special::None;
  bool operator==(const Keypress&) const = default;
};

}  // namespace terminal
