// Connections to programs that listen on a Unix socket.
#pragma once

#include <sys/types.h>

#include <string>

#include "platform/base/file_descriptor.h"

namespace linux::system {

/// Connects to the stream socket at that path, without waiting for anybody. None when nobody listens there,
/// or does not take connections at the moment. What comes of it does not block.
base::FileDescriptor connectTo(const std::string& path);

/// The process that listens at the other end; 0 when that cannot be told.
pid_t listenerOf(int connection);

}  // namespace linux::system
