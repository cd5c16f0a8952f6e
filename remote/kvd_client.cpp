#include "remote/kvd_client.h"

#include "messages/kvd_messages.h"
#include "platform/mach.h"

namespace {

// Fills in the header and sends. Requests come zeroed, padding included: nothing of this process's stack may
// reach another one. mach_msg writes msgh_size.
template <typename Request>
mach_msg_return_t send(Request& request, mach_port_t port, mach_msg_id_t id) {
  request.Head.msgh_bits = MACH_MSG_TYPE_COPY_SEND;
  request.Head.msgh_remote_port = port;
  request.Head.msgh_local_port = MACH_PORT_NULL;
  request.Head.msgh_id = id;
  return mach_msg(&request.Head, MACH_SEND_MSG | MACH_SEND_TIMEOUT, sizeof(Request), 0, MACH_PORT_NULL,
                  kKVDSendTimeout, MACH_PORT_NULL);
}

static_assert(KVD_SENT == KERN_SUCCESS && KVD_SENT == MACH_MSG_SUCCESS);
static_assert(KVD_NOT_FOUND == BOOTSTRAP_UNKNOWN_SERVICE);
static_assert(KVD_GONE == MACH_SEND_INVALID_DEST && KVD_QUEUE_FULL == MACH_SEND_TIMED_OUT);

}  // namespace

mach_msg_return_t kvd_look_up(mach_port_t* port) {
  mach_port_t bootstrap = MACH_PORT_NULL;
  const kern_return_t result = task_get_special_port(mach_task_self(), TASK_BOOTSTRAP_PORT, &bootstrap);
  return result == KERN_SUCCESS ? bootstrap_look_up(bootstrap, kKVDServiceName, port) : result;
}

mach_msg_return_t kvd_terminate(mach_port_t port) {
  kvd_terminate_request_t request = {};
  return send(request, port, kKVDTerminateID);
}

mach_msg_return_t kvd_handlehidevent(mach_port_t port, std::uint16_t usagePage, std::uint16_t usage,
                                     std::uint16_t extra, std::int32_t value) {
  kvd_handlehidevent_request_t request = {};
  request.NDR = NDR_record;
  request.usagePage = usagePage;
  request.usage = usage;
  request.extra = extra;
  request.value = value;
  return send(request, port, kKVDHandleHIDEventID);
}

mach_msg_return_t kvd_setscreenlocked(mach_port_t port, std::uint8_t locked) {
  kvd_setscreenlocked_request_t request = {};
  request.NDR = NDR_record;
  request.locked = locked;
  return send(request, port, kKVDSetScreenLockedID);
}
