// The send stubs of kvd's control messages, for whoever reads the remote.
//
// `port` is a send right to the service "com.tarn.kvd" (see bootstrap_look_up). Each call sends one message,
// waits for no answer, and returns what mach_msg returned: MACH_MSG_SUCCESS, MACH_SEND_TIMED_OUT when the
// daemon's queue stayed full for five seconds, MACH_SEND_INVALID_DEST when nobody is behind the port.
#pragma once

#include <cstdint>

#include "platform/mach.h"

/// Asks the daemon to quit.
mach_msg_return_t kvd_terminate(mach_port_t port);

/// Tells the daemon that a button, named by its USB HID usage page and usage, went down (value not 0) or came
/// up (value 0). The daemon keeps `extra` with the event and never interprets it.
mach_msg_return_t kvd_handlehidevent(mach_port_t port, std::uint16_t usagePage, std::uint16_t usage,
                                     std::uint16_t extra, std::int32_t value);

/// Tells the daemon that the screen was locked (locked not 0) or unlocked (locked 0).
mach_msg_return_t kvd_setscreenlocked(mach_port_t port, std::uint8_t locked);
