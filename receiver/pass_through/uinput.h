// The input device that the helper makes.
#pragma once

#include <cstdint>

#include "platform/base/file_descriptor.h"

namespace receiver::pass_through {

/// Makes the device, with kKeys and nothing else, through uinput's node at `path`. It goes with its
/// descriptor, and whatever is down on it is released then. Throws std::system_error where it cannot be made.
base::FileDescriptor makeDevice(const char* path);

/// Presses (1) or releases (0) a key. Throws std::system_error where that fails.
void press(const base::FileDescriptor& device, std::uint16_t key, std::uint16_t value);

}  // namespace receiver::pass_through
