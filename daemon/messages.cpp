#include "daemon/messages.h"

#include "daemon/lifecycle.h"

namespace {

template <typename Routine>
mig_impl_routine_t Impl(Routine* routine) {
  return reinterpret_cast<mig_impl_routine_t>(routine);
}

mig_reply_error_t* AsReply(mach_msg_header_t* reply) { return reinterpret_cast<mig_reply_error_t*>(reply); }

void Refuse(mach_msg_header_t* reply, kern_return_t error) {
  AsReply(reply)->NDR = NDR_record;
  AsReply(reply)->RetCode = error;
}

/// The request as a T, or null with MIG_BAD_ARGUMENTS in the reply when it is complex or of another size.
template <typename T>
T* CheckedRequest(mach_msg_header_t* request, mach_msg_header_t* reply) {
  if ((request->msgh_bits & MACH_MSGH_BITS_COMPLEX) == 0 && request->msgh_size == sizeof(T)) {
    return reinterpret_cast<T*>(request);
  }
  Refuse(reply, MIG_BAD_ARGUMENTS);
  return nullptr;
}

mig_routine_t FindStub(mach_msg_id_t id) {
  const auto index = static_cast<std::uint32_t>(id) - static_cast<std::uint32_t>(server_KVD_subsystem.start);
  return index < kKVDRoutineCount ? server_KVD_subsystem.routine[index].stub_routine : nullptr;
}

}  // namespace

const mig_subsystem_t server_KVD_subsystem = {
    KVD_server,
    kKVDTerminateID,
    kKVDTerminateID + kKVDRoutineCount,
    sizeof(mig_reply_error_t),
    {
        {Impl(server_terminate), _Xterminate, 1, sizeof(kvd_terminate_request_t)},
        {Impl(server_handlehidevent), _Xhandlehidevent, 5, sizeof(kvd_handlehidevent_request_t)},
        {Impl(server_setscreenlocked), _Xsetscreenlocked, 2, sizeof(kvd_setscreenlocked_request_t)},
    },
};

mig_routine_t KVD_server_routine(const mach_msg_header_t* request) { return FindStub(request->msgh_id); }

bool KVD_server(mach_msg_header_t* request, mach_msg_header_t* reply) {
  reply->msgh_bits = request->msgh_bits & MACH_MSGH_BITS_REMOTE_MASK;
  reply->msgh_remote_port = request->msgh_remote_port;
  reply->msgh_size = sizeof(mig_reply_error_t);
  reply->msgh_local_port = MACH_PORT_NULL;
  // Unsigned, because an id near the top of the range must wrap.
  reply->msgh_id = static_cast<mach_msg_id_t>(static_cast<std::uint32_t>(request->msgh_id) + 100);

  const mig_routine_t stub = FindStub(request->msgh_id);
  if (stub == nullptr) {
    Refuse(reply, MIG_BAD_ID);
    return false;
  }
  stub(request, reply);
  return true;
}

void _Xterminate(mach_msg_header_t* request, mach_msg_header_t* reply) {
  const auto* in = CheckedRequest<kvd_terminate_request_t>(request, reply);
  if (in == nullptr) return;
  AsReply(reply)->RetCode = server_terminate(in->Head.msgh_local_port);
}

void _Xhandlehidevent(mach_msg_header_t* request, mach_msg_header_t* reply) {
  auto* in = CheckedRequest<kvd_handlehidevent_request_t>(request, reply);
  if (in == nullptr) return;
  if (in->NDR.int_rep != NDR_record.int_rep) {
    in->usagePage = __builtin_bswap16(in->usagePage);
    in->usage = __builtin_bswap16(in->usage);
    in->extra = __builtin_bswap16(in->extra);
    in->value = static_cast<std::int32_t>(__builtin_bswap32(static_cast<std::uint32_t>(in->value)));
  }
  AsReply(reply)->RetCode =
      server_handlehidevent(in->Head.msgh_local_port, in->usagePage, in->usage, in->extra, in->value);
}

void _Xsetscreenlocked(mach_msg_header_t* request, mach_msg_header_t* reply) {
  const auto* in = CheckedRequest<kvd_setscreenlocked_request_t>(request, reply);
  if (in == nullptr) return;
  AsReply(reply)->RetCode = server_setscreenlocked(in->Head.msgh_local_port, in->locked);
}

void MachMessageReceivedCallback(HostPortRef, void* message, std::size_t, void*) {
  mig_reply_error_t reply = {};
  KVD_server(static_cast<mach_msg_header_t*>(message), &reply.Head);
}
