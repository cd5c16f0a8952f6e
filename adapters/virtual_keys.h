// Virtual key codes of the keyboard, as far as adapters press them.
#pragma once

#include <cstdint>

namespace VirtualKey {

inline constexpr std::uint16_t S = 1;
inline constexpr std::uint16_t Return = 36;
inline constexpr std::uint16_t Space = 49;
inline constexpr std::uint16_t Escape = 53;
inline constexpr std::uint16_t LeftArrow = 123;
inline constexpr std::uint16_t RightArrow = 124;
inline constexpr std::uint16_t DownArrow = 125;
inline constexpr std::uint16_t UpArrow = 126;

}  // namespace VirtualKey
