// The requests that kvd answers, as they lie in a message: shared by the send stubs and the daemon's decoder.
//
// The header is in this machine's byte order; the fields behind the NDR record are in the sender's, which
// the record names. Every request is one-way.
#pragma once

#include <cstddef>
#include <cstdint>

#include "platform/mach.h"

/// The name under which the daemon checks its service port in.
inline constexpr char kKVDServiceName[] = "com.tarn.kvd";

inline constexpr mach_msg_id_t kKVDTerminateID = 600;
inline constexpr mach_msg_id_t kKVDHandleHIDEventID = 601;
inline constexpr mach_msg_id_t kKVDSetScreenLockedID = 602;

/// How long a send waits for room in the daemon's queue, in milliseconds.
inline constexpr mach_msg_timeout_t kKVDSendTimeout = 5000;

static_assert(offsetof(mach_msg_header_t, msgh_bits) == 0);
static_assert(offsetof(mach_msg_header_t, msgh_size) == 4);
static_assert(offsetof(mach_msg_header_t, msgh_remote_port) == 8);
static_assert(offsetof(mach_msg_header_t, msgh_local_port) == 12);
static_assert(offsetof(mach_msg_header_t, msgh_reserved) == 16);
static_assert(offsetof(mach_msg_header_t, msgh_id) == 20);

/// Asks the daemon to quit.
struct kvd_terminate_request_t {
  mach_msg_header_t Head;
};
static_assert(sizeof(kvd_terminate_request_t) == 24);

/// One button of the remote went down (value not 0) or came up (value 0).
struct kvd_handlehidevent_request_t {
  mach_msg_header_t Head;
  NDR_record_t NDR;
  std::uint16_t usagePage;
  std::uint16_t usagePagePad;
  std::uint16_t usage;
  std::uint16_t usagePad;
  std::uint16_t extra;
  std::uint16_t extraPad;
  std::int32_t value;
};
static_assert(sizeof(kvd_handlehidevent_request_t) == 48);
static_assert(offsetof(kvd_handlehidevent_request_t, NDR) == 24);
static_assert(offsetof(kvd_handlehidevent_request_t, usagePage) == 32);
static_assert(offsetof(kvd_handlehidevent_request_t, usagePagePad) == 34);
static_assert(offsetof(kvd_handlehidevent_request_t, usage) == 36);
static_assert(offsetof(kvd_handlehidevent_request_t, usagePad) == 38);
static_assert(offsetof(kvd_handlehidevent_request_t, extra) == 40);
static_assert(offsetof(kvd_handlehidevent_request_t, extraPad) == 42);
static_assert(offsetof(kvd_handlehidevent_request_t, value) == 44);

/// The screen was locked (locked not 0) or unlocked (locked 0).
struct kvd_setscreenlocked_request_t {
  mach_msg_header_t Head;
  NDR_record_t NDR;
  std::uint8_t locked;
  std::uint8_t lockedPad[3];
};
static_assert(sizeof(kvd_setscreenlocked_request_t) == 36);
static_assert(offsetof(kvd_setscreenlocked_request_t, NDR) == 24);
static_assert(offsetof(kvd_setscreenlocked_request_t, locked) == 32);
static_assert(offsetof(kvd_setscreenlocked_request_t, lockedPad) == 33);
