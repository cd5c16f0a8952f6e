// The names that --list and --monitor give things.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "receiver/verdict.h"
#include "remote/buttons.h"

namespace receiver {

/// KEY_PLAY and its like; a number for a key without a name.
std::string nameOf(std::uint16_t key);

/// The usage's name and numbers: Play (0x0C 0xB0).
std::string nameOf(const remote::Button& button);

/// Path and name of a device, on one line whatever the name holds.
std::string nameOf(const Node& node);

}  // namespace receiver
