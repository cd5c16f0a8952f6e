#pragma once

#include <string_view>

#include "platform/base/file_descriptor.h"

namespace base {

/// The bound datagram socket that the service manager passed for this service; none when it passed no such
/// socket. The variables that announce passed sockets are gone afterwards and the sockets are closed on exec.
FileDescriptor passedSocket(std::string_view service);

}  // namespace base
