// Mach calls that keep what is sent instead of sending it.
#pragma once

#include <functional>
#include <vector>

#include "platform/mach.h"

inline constexpr mach_port_t kFakePort = 0x1234;

struct SentMessage {
  std::vector<std::uint8_t> bytes;
  /// Option, send size, receive size, receive port, time-out, notify port.
  std::vector<std::int64_t> arguments;
};

inline std::vector<SentMessage> gSent;
inline std::function<mach_msg_return_t()> gSendResult = [] { return MACH_MSG_SUCCESS; };
inline kern_return_t gLookUpResult = KERN_SUCCESS;
