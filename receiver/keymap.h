// Which button a key of a remote is.
#pragma once

#include <cstdint>
#include <optional>

#include "remote/buttons.h"

namespace receiver {

/// How a remote's keys reach the kernel, which settles what some of them mean.
enum class Road { Infrared, CEC, AVRCP, HID };

/// What the meaning of a remote's keys depends on.
struct Keyboard {
  Road road = Road::Infrared;
  /// The remote has a key for the volume, on this node or on another one of the same device.
  bool volumeKeys = false;
};

/// The button behind a key (KEY_… of linux/input-event-codes.h); null where kvd has no use for it. `scan` is
/// what MSC_SCAN told with it: on a HID remote the usage page and usage, elsewhere of no meaning here.
const remote::Button* buttonOf(std::uint16_t key, std::optional<std::uint32_t> scan,
                               const Keyboard& keyboard);

/// Whether the key is a button on any remote.
bool isButton(std::uint16_t key);

}  // namespace receiver
