// What the core asks of the host, counted and made to fail.
#pragma once

#include <cstdint>

#include "platform/host.h"

namespace simulator {

/// Lets the call of this number fail, counted from here on; 0 lets none fail. The operation's name is the
/// word that the rehearsal leaves.
void letCallFail(std::uint64_t number);
/// How many calls were counted.
std::uint64_t callCount();

/// Whether this call of an operation is the one that fails.
bool fails(const char* operation);

/// Told of a key before it goes to a process.
void keyIsPosted(const HostProcessSerialNumber& process);
/// Told of what came of sending an event; returns it.
std::int32_t eventIsSent(std::int32_t result);

}  // namespace simulator
