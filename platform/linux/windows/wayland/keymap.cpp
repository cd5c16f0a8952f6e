#include "platform/linux/windows/wayland/keymap.h"

#include <xkbcommon/xkbcommon.h>

#include <cstdlib>
#include <memory>
#include <utility>

namespace linux::windows::wayland {

namespace {

/// An evdev code is so much less than xkb's.
constexpr xkb_keycode_t kEvdevOffset = 8;

/// Of xkb's first eight modifiers, which are the same on every keyboard.
constexpr std::pair<Modifier, std::uint32_t> kMasks[] = {
    {kShift, 1U << 0},
    {kControl, 1U << 2},
    {kAlt, 1U << 3},
};

void addPlaces(xkb_keymap* keymap, xkb_keycode_t code, void* data) {
  auto& places = *static_cast<std::map<std::uint32_t, Place>*>(data);
  // The levels of the plain key and of the one with Shift.
  for (const Modifiers modifiers : {kNoModifier, kShift}) {
    const xkb_keysym_t* symbols = nullptr;
    const xkb_level_index_t level = modifiers == kShift ? 1 : 0;
    if (code >= kEvdevOffset && xkb_keymap_key_get_syms_by_level(keymap, code, 0, level, &symbols) == 1) {
      places.try_emplace(*symbols, Place{code - kEvdevOffset, modifiers});
    }
  }
}

using Context = std::unique_ptr<xkb_context, decltype(&xkb_context_unref)>;

Context makeContext() { return {xkb_context_new(XKB_CONTEXT_NO_ENVIRONMENT_NAMES), xkb_context_unref}; }

}  // namespace

Keymap makeKeymap() {
  Keymap made;
  const Context context = makeContext();
  if (context == nullptr) return made;
  constexpr xkb_rule_names kAmerican{"evdev", "pc105", "us", "", ""};
  const std::unique_ptr<xkb_keymap, decltype(&xkb_keymap_unref)> keymap(
      xkb_keymap_new_from_names(context.get(), &kAmerican, XKB_KEYMAP_COMPILE_NO_FLAGS), xkb_keymap_unref);
  if (keymap == nullptr) return made;
  const std::unique_ptr<char, decltype(&std::free)> text(
      xkb_keymap_get_as_string(keymap.get(), XKB_KEYMAP_FORMAT_TEXT_V1), std::free);
  if (text == nullptr) return made;
  made.text = text.get();
  xkb_keymap_key_for_each(keymap.get(), addPlaces, &made.places);
  return made;
}

std::map<std::uint32_t, Place> placesIn(std::string_view text) {
  std::map<std::uint32_t, Place> places;
  text = text.substr(0, text.find('\0'));
  const Context context = makeContext();
  if (context == nullptr) return places;
  const std::unique_ptr<xkb_keymap, decltype(&xkb_keymap_unref)> keymap(
      xkb_keymap_new_from_buffer(context.get(), text.data(), text.size(), XKB_KEYMAP_FORMAT_TEXT_V1,
                                 XKB_KEYMAP_COMPILE_NO_FLAGS),
      xkb_keymap_unref);
  if (keymap != nullptr) xkb_keymap_key_for_each(keymap.get(), addPlaces, &places);
  return places;
}

std::uint32_t maskOf(Modifiers modifiers) {
  std::uint32_t mask = 0;
  for (const auto& [modifier, bit] : kMasks) {
    if ((modifiers & modifier) != 0) mask |= bit;
  }
  return mask;
}

}  // namespace linux::windows::wayland
