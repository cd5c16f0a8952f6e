// The receiving end of a port: the kernel's queue, and before it in order what had to be read ahead.
#pragma once

#include <sys/types.h>

#include <cstddef>
#include <deque>
#include <optional>
#include <vector>

#include "platform/base/file_descriptor.h"
#include "platform/mach.h"

namespace base {

/// A message as it came off the socket.
struct Datagram {
  std::vector<std::byte> bytes;
  /// Sent by this user or by root, and arrived whole.
  bool trusted = false;
  /// The process that sent it; 0 where that is unknown.
  pid_t sender = 0;
};

class ReceiveQueue {
 public:
  explicit ReceiveQueue(FileDescriptor socket);

  int socket() const { return socket_.get(); }
  /// True while messages that were read ahead wait in memory.
  bool hasReadAhead() const { return !readAhead_.empty(); }
  /// Takes the oldest message; nothing when none waits. Never blocks.
  std::optional<Datagram> take();
  /// Empties the kernel's queue into memory. True when there was something in it.
  bool drain();
  /// True in the process that took the receive right; a forked child inherits the socket but not the right.
  bool isOurs() const;

 private:
  FileDescriptor socket_;
  pid_t owner_;
  uid_t user_;
  std::deque<Datagram> readAhead_;
};

/// The queue behind a name that this process has checked in, kept until the process ends; else null.
ReceiveQueue* receiveQueue(mach_port_t name);

/// Makes the socket this process's receive right of that name.
void openReceiveQueue(mach_port_t name, FileDescriptor socket);

}  // namespace base
