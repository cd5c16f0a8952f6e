#include "platform/linux/windows/keysyms.h"

#include <algorithm>
#include <iterator>
#include <utility>

#include "platform/host.h"

namespace linux::windows {

namespace {

// clang-format off
struct NamedKey {
  const char* name;
  std::uint32_t keysym;
};

/// Printable ASCII characters are their own names and keysyms.
constexpr NamedKey kNames[] = {
    {"space", 0x0020},  {"BackSpace", 0xFF08}, {"Tab", 0xFF09},   {"Return", 0xFF0D}, {"Pause", 0xFF13},
    {"Escape", 0xFF1B}, {"Home", 0xFF50},      {"Left", 0xFF51},  {"Up", 0xFF52},     {"Right", 0xFF53},
    {"Down", 0xFF54},   {"Prior", 0xFF55},     {"Next", 0xFF56},  {"End", 0xFF57},    {"Insert", 0xFF63},
    {"Delete", 0xFFFF}, {"period", 0x002E},    {"comma", 0x002C}, {"plus", 0x002B},   {"minus", 0x002D},
    {"F1", 0xFFBE},     {"F2", 0xFFBF},        {"F3", 0xFFC0},    {"F4", 0xFFC1},     {"F5", 0xFFC2},
    {"F6", 0xFFC3},     {"F7", 0xFFC4},        {"F8", 0xFFC5},    {"F9", 0xFFC6},     {"F10", 0xFFC7},
    {"F11", 0xFFC8},    {"F12", 0xFFC9},
};

struct VirtualKey {
  std::uint16_t code;
  const char* name;
};

constexpr VirtualKey kVirtualKeys[] = {
    {HostVirtualKey::S, "s"},
    {HostVirtualKey::Return, "Return"},
    {HostVirtualKey::Tab, "Tab"},
    {HostVirtualKey::Space, "space"},
    {HostVirtualKey::Escape, "Escape"},
    {HostVirtualKey::LeftArrow, "Left"},
    {HostVirtualKey::RightArrow, "Right"},
    {HostVirtualKey::DownArrow, "Down"},
    {HostVirtualKey::UpArrow, "Up"},
    {0, "a"},
    {2, "d"},
    {3, "f"},
    {4, "h"},
    {5, "g"},
    {6, "z"},
    {7, "x"},
    {8, "c"},
    {9, "v"},
    {11, "b"},
    {12, "q"},
    {13, "w"},
    {14, "e"},
    {15, "r"},
    {16, "y"},
    {17, "t"},
    {31, "o"},
    {32, "u"},
    {34, "i"},
    {35, "p"},
    {37, "l"},
    {38, "j"},
    {40, "k"},
    {45, "n"},
    {46, "m"},
    {18, "1"},
    {19, "2"},
    {20, "3"},
    {21, "4"},
    {22, "6"},
    {23, "5"},
    {25, "9"},
    {26, "7"},
    {28, "8"},
    {29, "0"},
    {51, "BackSpace"},
    {115, "Home"},
    {116, "Prior"},
    {117, "Delete"},
    {119, "End"},
    {121, "Next"},
    {122, "F1"},
    {120, "F2"},
    {99, "F3"},
    {118, "F4"},
    {96, "F5"},
    {97, "F6"},
    {98, "F7"},
    {100, "F8"},
    {101, "F9"},
    {109, "F10"},
    {103, "F11"},
    {111, "F12"},
};

constexpr std::pair<std::string_view, Modifier> kModifiers[] = {
    {"Shift+", kShift},
    {"Control+", kControl},
    {"Alt+", kAlt},
};
// clang-format on

/// 0 for a text that names no key.
std::uint32_t keysymNamed(std::string_view name) {
  if (name.size() == 1 && name[0] > ' ' && name[0] <= '~') return static_cast<unsigned char>(name[0]);
  const auto* const key = std::find_if(std::begin(kNames), std::end(kNames),
                                       [&](const NamedKey& row) { return row.name == name; });
  return key != std::end(kNames) ? key->keysym : 0;
}

}  // namespace

std::uint32_t keysymOf(std::uint16_t virtualKey) {
  const auto* const key = std::find_if(std::begin(kVirtualKeys), std::end(kVirtualKeys),
                                       [&](const VirtualKey& row) { return row.code == virtualKey; });
  return key != std::end(kVirtualKeys) ? keysymNamed(key->name) : 0;
}

std::optional<KeyStroke> parseKey(std::string_view text) {
  KeyStroke stroke;
  for (bool found = true; found;) {
    found = false;
    for (const auto& [name, modifier] : kModifiers) {
      if (!text.starts_with(name)) continue;
      text.remove_prefix(name.size());
      stroke.modifiers = static_cast<Modifiers>(stroke.modifiers | modifier);
      found = true;
    }
  }
  stroke.keysym = keysymNamed(text);
  if (stroke.keysym == 0) return std::nullopt;
  return stroke;
}

}  // namespace linux::windows
