#pragma once

#include <string_view>

#include "platform/base/file_descriptor.h"
#include "platform/mach.h"

namespace base {

/// Binds a socket of our own for the service, which goes again when the process exits. KERN_SUCCESS with the
/// socket in `bound`; BOOTSTRAP_SERVICE_ACTIVE while a live process listens there; KERN_FAILURE otherwise.
/// The failure is noted.
kern_return_t bindServiceSocket(std::string_view service, FileDescriptor& bound);

}  // namespace base
