// The little of sockets that both ends of a port need.
#pragma once

#include <sys/un.h>

#include "platform/base/file_descriptor.h"

namespace base {

/// A datagram socket, non-blocking and closed on exec; none when there are no descriptors left.
FileDescriptor datagramSocket();

/// A datagram socket connected to an address; none, with errno set, when nobody is there.
FileDescriptor connectedSocket(const sockaddr_un& address);

}  // namespace base
