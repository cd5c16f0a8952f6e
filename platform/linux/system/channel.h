// Lines of text to and from a program, over a Unix socket on which it listens.
//
// The socket is found through the process, whatever path its configuration gave it.
#pragma once

#include <sys/types.h>

#include <optional>
#include <string>
#include <string_view>

#include "platform/base/deadline.h"
#include "platform/base/file_descriptor.h"
#include "platform/linux/system/turn.h"

namespace linux::system {

/// Who listens: a process, and the name of the executable that it must be running.
struct Listener {
  pid_t process = 0;
  std::string_view executable;
};

/// The path on which it listens; empty when it does not.
std::string channelPath(const Listener& listener);

/// A connection for one exchange.
class Channel {
 public:
  /// Connects. Not open when nobody takes the connection, or somebody else, and at once when the process has
  /// timed out in this turn. The limit is for the whole exchange; letting it run out counts as a time-out of
  /// the process only where the caller says so (noteTimeout).
  Channel(const Listener& listener, Limit limit);

  bool isOpen() const { return static_cast<bool>(socket_); }
  /// Sends a text whole; false when it does not get through.
  bool write(std::string_view text);
  /// The next line that comes, without its end; nothing at the end and when the time is up.
  std::optional<std::string> readLine();
  /// Whether the time was up before everything was sent and read.
  bool timedOut() const { return timedOut_; }

 private:
  bool waitFor(short events);
  void noteTooLate();

  const Limit limit_;
  const base::Deadline deadline_;
  base::FileDescriptor socket_;
  bool timedOut_ = false;
  std::string received_;
};

}  // namespace linux::system
