// The Mach calls, types and constants that kvd uses, under their own names.
//
// A port is a message queue with many senders and one receiver. Here a port is a Unix datagram socket and a
// port name is a small number that only this process understands; platform/base says how the two meet.
#pragma once

#include <cstdint>

using kern_return_t = std::int32_t;
using mach_port_t = std::uint32_t;
using mach_msg_bits_t = std::uint32_t;
using mach_msg_size_t = std::uint32_t;
using mach_msg_id_t = std::int32_t;
using mach_msg_option_t = std::int32_t;
using mach_msg_timeout_t = std::uint32_t;
using mach_msg_return_t = kern_return_t;

inline constexpr mach_port_t MACH_PORT_NULL = 0;

inline constexpr kern_return_t KERN_SUCCESS = 0;
inline constexpr kern_return_t KERN_INVALID_ARGUMENT = 4;
inline constexpr kern_return_t KERN_FAILURE = 5;

inline constexpr kern_return_t BOOTSTRAP_NOT_PRIVILEGED = 1100;
inline constexpr kern_return_t BOOTSTRAP_UNKNOWN_SERVICE = 1102;
inline constexpr kern_return_t BOOTSTRAP_SERVICE_ACTIVE = 1103;

inline constexpr int TASK_BOOTSTRAP_PORT = 4;

/// What every message begins with; always in the byte order of this machine.
struct mach_msg_header_t {
  mach_msg_bits_t msgh_bits;
  mach_msg_size_t msgh_size;
  mach_port_t msgh_remote_port;
  mach_port_t msgh_local_port;
  std::uint32_t msgh_reserved;
  mach_msg_id_t msgh_id;
};
static_assert(sizeof(mach_msg_header_t) == 24);

/// Top bit of msgh_bits: the message carries rights or memory beside its bytes.
inline constexpr mach_msg_bits_t MACH_MSGH_BITS_COMPLEX = 0x80000000;
/// Low byte of msgh_bits: what the sender did with the remote port.
inline constexpr mach_msg_bits_t MACH_MSGH_BITS_REMOTE_MASK = 0xFF;
/// A disposition as received: a send right.
inline constexpr mach_msg_bits_t MACH_MSG_TYPE_PORT_SEND = 17;
/// A disposition as sent: a copy of the sender's send right.
inline constexpr mach_msg_bits_t MACH_MSG_TYPE_COPY_SEND = 19;

inline constexpr mach_msg_option_t MACH_SEND_MSG = 0x01;
inline constexpr mach_msg_option_t MACH_SEND_TIMEOUT = 0x10;

inline constexpr mach_msg_return_t MACH_MSG_SUCCESS = 0;
inline constexpr mach_msg_return_t MACH_SEND_INVALID_DATA = 0x10000002;
inline constexpr mach_msg_return_t MACH_SEND_INVALID_DEST = 0x10000003;
inline constexpr mach_msg_return_t MACH_SEND_TIMED_OUT = 0x10000004;
inline constexpr mach_msg_return_t MACH_SEND_MSG_TOO_SMALL = 0x10000008;

/// How the sender of a message writes its numbers (Network Data Representation), one byte a field.
struct NDR_record_t {
  std::uint8_t mig_vers;
  std::uint8_t if_vers;
  std::uint8_t reserved1;
  std::uint8_t mig_encoding;
  std::uint8_t int_rep;
  std::uint8_t char_rep;
  std::uint8_t float_rep;
  std::uint8_t reserved2;
};
static_assert(sizeof(NDR_record_t) == 8);

inline constexpr std::uint8_t NDR_INT_BIG_ENDIAN = 0;
inline constexpr std::uint8_t NDR_INT_LITTLE_ENDIAN = 1;

/// This process's own data representation.
extern const NDR_record_t NDR_record;

inline constexpr kern_return_t MIG_BAD_ID = -303;
inline constexpr kern_return_t MIG_BAD_ARGUMENTS = -304;

/// The reply that the Mach Interface Generator's servers fill in.
struct mig_reply_error_t {
  mach_msg_header_t Head;
  NDR_record_t NDR;
  kern_return_t RetCode;
};
static_assert(sizeof(mig_reply_error_t) == 36);

/// The port that stands for the calling task.
mach_port_t mach_task_self();

/// Stores one of the task's special ports in *port. KERN_SUCCESS, or another code with *port unchanged.
kern_return_t task_get_special_port(mach_port_t task, int which, mach_port_t* port);

/// Takes the receive right of the named service from the bootstrap server: the socket that the service
/// manager passed, else one of our own. KERN_SUCCESS; BOOTSTRAP_SERVICE_ACTIVE while another live process
/// holds the service; another code for every other failure. The right is given up when the process exits.
kern_return_t bootstrap_check_in(mach_port_t bootstrap, const char* service, mach_port_t* port);

/// Finds the named service for sending. KERN_SUCCESS, or BOOTSTRAP_UNKNOWN_SERVICE when nobody has checked
/// in.
kern_return_t bootstrap_look_up(mach_port_t bootstrap, const char* service, mach_port_t* port);

/// Sends one message: `option` must hold MACH_SEND_MSG; receiving is not offered here (the run loop
/// receives). With MACH_SEND_TIMEOUT a queue that stays full for `timeout` milliseconds gives
/// MACH_SEND_TIMED_OUT, without it the call waits. MACH_SEND_INVALID_DEST when nobody is behind the port.
/// Never changes *message but for msgh_size, which becomes `send_size`.
mach_msg_return_t mach_msg(mach_msg_header_t* message, mach_msg_option_t option, mach_msg_size_t send_size,
                           mach_msg_size_t receive_size, mach_port_t receive_port, mach_msg_timeout_t timeout,
                           mach_port_t notify_port);
