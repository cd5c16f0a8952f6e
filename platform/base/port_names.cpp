#include "platform/base/port_names.h"

#include <algorithm>
#include <bit>
#include <string>
#include <vector>

namespace base {
namespace {

struct ServicePort {
  std::string service;
  FileDescriptor sender;
};

constexpr mach_port_t kFirstServicePort = kBootstrapPort + 1;

/// In the order of their names.
std::vector<ServicePort> ports;

bool isServicePort(mach_port_t name) {
  return name >= kFirstServicePort && name - kFirstServicePort < ports.size();
}

}  // namespace

MakeRoom makeRoom = nullptr;
BootstrapTest bootstrapIsThere = nullptr;

mach_port_t portName(std::string_view service) {
  const auto known = std::ranges::find(ports, service, &ServicePort::service);
  const auto index = known - ports.begin();
  if (known == ports.end()) ports.push_back({std::string(service), FileDescriptor()});
  return kFirstServicePort + static_cast<mach_port_t>(index);
}

void setSendSocket(mach_port_t name, FileDescriptor socket) {
  if (isServicePort(name)) ports[name - kFirstServicePort].sender = std::move(socket);
}

int sendSocket(mach_port_t name) {
  return isServicePort(name) ? ports[name - kFirstServicePort].sender.get() : -1;
}

}  // namespace base

const NDR_record_t NDR_record = {
    .mig_vers = 0,
    .if_vers = 0,
    .reserved1 = 0,
    .mig_encoding = 0,
    .int_rep = std::endian::native == std::endian::little ? NDR_INT_LITTLE_ENDIAN : NDR_INT_BIG_ENDIAN,
    .char_rep = 0,
    .float_rep = 0,
    .reserved2 = 0,
};

mach_port_t mach_task_self() { return base::kTaskPort; }

kern_return_t task_get_special_port(mach_port_t task, int which, mach_port_t* port) {
  if (task != base::kTaskPort || which != TASK_BOOTSTRAP_PORT || port == nullptr) {
    return KERN_INVALID_ARGUMENT;
  }
  if (base::bootstrapIsThere != nullptr && !base::bootstrapIsThere()) return KERN_FAILURE;
  *port = base::kBootstrapPort;
  return KERN_SUCCESS;
}
