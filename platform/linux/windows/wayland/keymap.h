// Keyboards to type on: which key makes which symbol.
#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <string_view>

#include "platform/linux/windows/backend.h"

namespace linux::windows::wayland {

/// A key by its evdev code, and the modifiers that make it yield a symbol.
struct Place {
  std::uint32_t key = 0;
  Modifiers modifiers = kNoModifier;
};

struct Keymap {
  /// As xkb writes it.
  std::string text;
  /// By keysym.
  std::map<std::uint32_t, Place> places;
};

/// An American keyboard, which has every key that programs are told to take, where programs that look at
/// positions expect it. Empty where xkb's files are missing.
Keymap makeKeymap();

/// The keys of a keyboard that xkb's text describes, in its first layout; none when it is no such text.
std::map<std::uint32_t, Place> placesIn(std::string_view text);

/// Modifiers in the bits that every keyboard has for them.
std::uint32_t maskOf(Modifiers modifiers);

}  // namespace linux::windows::wayland
