// Mach calls that keep what is sent instead of sending it.
#pragma once

#include <functional>
#include <vector>

#include "platform/mach.h"

inline constexpr mach_port_t kFakePort = 0x1234;

struct SentMessage {
  std::vector<std::uint8_t> bytes;
  mach_msg_option_t option;
  mach_msg_size_t receiveSize;
  mach_port_t receivePort;
  mach_msg_timeout_t timeout;
  mach_port_t notifyPort;
  friend bool operator==(const SentMessage&, const SentMessage&) = default;
};

inline std::vector<SentMessage> gSent;
inline std::function<mach_msg_return_t()> gSendResult = [] { return MACH_MSG_SUCCESS; };
inline kern_return_t gLookUpResult = KERN_SUCCESS;
