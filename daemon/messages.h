// The daemon's side of the control messages, by the conventions of the Mach Interface Generator: checks,
// decoding, the reply record, and the table that other code can find the routines in. messages/kvd_messages.h
// has the layouts.
#pragma once

#include <cstddef>

#include "messages/kvd_messages.h"
#include "platform/host.h"

/// Decodes one request and runs its work routine.
using mig_routine_t = void (*)(mach_msg_header_t* request, mach_msg_header_t* reply);
/// A whole subsystem's server function.
using mig_server_t = bool (*)(mach_msg_header_t* request, mach_msg_header_t* reply);
/// A work routine, whatever its arguments; cast back before it is called.
using mig_impl_routine_t = void (*)();

struct mig_routine_descriptor_t {
  mig_impl_routine_t impl_routine;
  mig_routine_t stub_routine;
  unsigned argc;                ///< arguments counted, the arrival port included
  mach_msg_size_t max_request;  ///< bytes of the request, exactly
};

inline constexpr mach_msg_id_t kKVDRoutineCount = 3;

struct mig_subsystem_t {
  mig_server_t server;
  mach_msg_id_t start;      ///< first message id
  mach_msg_id_t end;        ///< past the last one
  mach_msg_size_t maxsize;  ///< bytes of the largest reply
  mig_routine_descriptor_t routine[kKVDRoutineCount];
};

extern const mig_subsystem_t server_KVD_subsystem;

/// Bytes of the largest request.
inline constexpr std::size_t kKVDLargestRequest = sizeof(kvd_handlehidevent_request_t);

/// Fills in the reply (36 bytes) and runs the stub for the request's id. False, with MIG_BAD_ID in the reply,
/// for an id that is none of ours.
bool KVD_server(mach_msg_header_t* request, mach_msg_header_t* reply);
/// The stub for a request's id, or null. Exported with the subsystem; the daemon itself does not call it.
mig_routine_t KVD_server_routine(const mach_msg_header_t* request);

void _Xterminate(mach_msg_header_t* request, mach_msg_header_t* reply);
/// Swaps the numbers of a sender with the other byte order in place.
void _Xhandlehidevent(mach_msg_header_t* request, mach_msg_header_t* reply);
void _Xsetscreenlocked(mach_msg_header_t* request, mach_msg_header_t* reply);

/// The service port's callback. The reply is filled in and never sent: all three routines are one-way.
void MachMessageReceivedCallback(HostPortRef port, void* message, std::size_t size, void* info);
