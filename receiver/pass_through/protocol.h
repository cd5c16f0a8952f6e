// What the receiver and the helper that hands keys on to the desktop say to each other.
//
// The receiver keeps remotes to itself, so that a press is not acted upon twice. Keys that kvd has no use for
// must reach the desktop all the same: the helper, which alone may open /dev/uinput, makes one input device
// with exactly these keys and presses on it what comes in over its connection. The device goes with the
// connection. The descriptor stays with the helper: whoever has it can make another device of it, with any
// keys.
#pragma once

#include <linux/input-event-codes.h>

#include <algorithm>
#include <array>
#include <cstdint>

namespace receiver::pass_through {

/// Where the helper listens: sequenced packets, a KeyPress each.
inline constexpr char kSocket[] = "/run/kvd/pass-through";

/// The packet that the helper sends when its device is there; whom it does not serve it sends none.
inline constexpr std::uint8_t kReady = 1;

/// A key went down (1) or came up (0).
struct KeyPress {
  std::uint16_t key;
  std::uint16_t value;
};

/// Every key that is handed on.
inline constexpr auto kKeys = std::to_array<std::uint16_t>({
    KEY_MUTE,
    KEY_POWER,
    KEY_CHANNELUP,
    KEY_CHANNELDOWN,
    KEY_RED,
    KEY_GREEN,
    KEY_YELLOW,
    KEY_BLUE,
    KEY_0,
    KEY_1,
    KEY_2,
    KEY_3,
    KEY_4,
    KEY_5,
    KEY_6,
    KEY_7,
    KEY_8,
    KEY_9,
    KEY_NUMERIC_0,
    KEY_NUMERIC_1,
    KEY_NUMERIC_2,
    KEY_NUMERIC_3,
    KEY_NUMERIC_4,
    KEY_NUMERIC_5,
    KEY_NUMERIC_6,
    KEY_NUMERIC_7,
    KEY_NUMERIC_8,
    KEY_NUMERIC_9,
    KEY_NUMERIC_STAR,
    KEY_NUMERIC_POUND,
});

/// Whether a key is handed on.
constexpr bool handsOn(std::uint16_t key) { return std::ranges::find(kKeys, key) != kKeys.end(); }

}  // namespace receiver::pass_through
