// Virtual key codes of the keyboard, as far as the models know them.
#pragma once

#include <cstdint>

namespace stage::keys {

inline constexpr std::uint16_t kS = 1;
inline constexpr std::uint16_t kReturn = 36;
inline constexpr std::uint16_t kTab = 48;
inline constexpr std::uint16_t kSpace = 49;
inline constexpr std::uint16_t kEscape = 53;
inline constexpr std::uint16_t kShift = 56;
inline constexpr std::uint16_t kLeftArrow = 123;
inline constexpr std::uint16_t kRightArrow = 124;
inline constexpr std::uint16_t kDownArrow = 125;
inline constexpr std::uint16_t kUpArrow = 126;

}  // namespace stage::keys
