// kvd's control messages, for whoever reads a remote; for C and C++.
//
// Look the port up once and keep it. Each message is sent without waiting for an answer; a daemon whose queue
// is full is waited for, five seconds at most. Not for several threads at once.
#pragma once

#include <stdint.h>  // NOLINT(modernize-deprecated-headers): C includes this

#ifdef __cplusplus
extern "C" {
#endif

typedef uint32_t mach_port_t;       // NOLINT(modernize-use-using): C includes this
typedef int32_t mach_msg_return_t;  // NOLINT(modernize-use-using): C includes this

/// What the calls return; other numbers are other errors.
enum {
  KVD_SENT = 0,
  /// Nobody listens: there is neither a daemon nor a service manager that would start it.
  KVD_NOT_FOUND = 1102,
  /// Whoever listened has ended since; look the port up again.
  KVD_GONE = 0x10000003,
  /// The daemon's queue stayed full for five seconds.
  KVD_QUEUE_FULL = 0x10000004
};

/// Stores the service port of the user's daemon, which is never 0, in *port; it need not be given back.
/// Called again, it renews the port. KVD_SENT; else KVD_NOT_FOUND or another error, with *port unchanged.
mach_msg_return_t kvd_look_up(mach_port_t* port);

/// Asks the daemon to quit.
mach_msg_return_t kvd_terminate(mach_port_t port);

/// Tells the daemon that a button, named by its USB HID usage page and usage, went down (value not 0) or came
/// up (value 0). The daemon keeps `extra` with the event and never interprets it.
mach_msg_return_t kvd_handlehidevent(mach_port_t port, uint16_t usagePage, uint16_t usage, uint16_t extra,
                                     int32_t value);

/// Tells the daemon that the screen was locked (locked not 0) or unlocked (locked 0).
mach_msg_return_t kvd_setscreenlocked(mach_port_t port, uint8_t locked);

#ifdef __cplusplus
}
#endif
