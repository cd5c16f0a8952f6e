#include "tests/remote/fake_mach.h"

#include <string_view>

const NDR_record_t NDR_record = {0xA0, 0xA1, 0xA2, 0xA3, 0xA4, 0xA5, 0xA6, 0xA7};

mach_port_t mach_task_self() { return 1; }

kern_return_t task_get_special_port(mach_port_t task, int which, mach_port_t* port) {
  *port = 2;
  return task == 1 && which == TASK_BOOTSTRAP_PORT ? KERN_SUCCESS : KERN_FAILURE;
}

kern_return_t bootstrap_look_up(mach_port_t bootstrap, const char* service, mach_port_t* port) {
  *port = kFakePort;
  return bootstrap == 2 && std::string_view(service) == "com.tarn.kvd" ? gLookUpResult : KERN_FAILURE;
}

mach_msg_return_t mach_msg(mach_msg_header_t* message, mach_msg_option_t option, mach_msg_size_t send_size,
                           mach_msg_size_t receive_size, mach_port_t receive_port, mach_msg_timeout_t timeout,
                           mach_port_t notify_port) {
  const auto* bytes = reinterpret_cast<const std::uint8_t*>(message);
  gSent.push_back(
      {{bytes, bytes + send_size}, {option, send_size, receive_size, receive_port, timeout, notify_port}});
  return gSendResult();
}
