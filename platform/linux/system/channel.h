// Lines of text to and from a program, over a Unix socket on which it listens.
//
// The socket is found through the process, whatever path its configuration gave it.
#pragma once

#include <sys/types.h>

#include <optional>
#include <string>
#include <string_view>

#include "platform/linux/system/turn.h"

namespace desktop {

/// The path on which a process that runs this executable listens; empty when it does not.
std::string channelPath(pid_t process, std::string_view executable);

/// A connection for one exchange.
class Channel {
 public:
  /// Connects. Not open when nobody takes the connection, and at once when the process has timed out in this
  /// turn. The limit is for the whole exchange.
  Channel(pid_t process, std::string_view executable, Microseconds limit);
  ~Channel();
  Channel(const Channel&) = delete;
  Channel& operator=(const Channel&) = delete;

  bool isOpen() const { return socket_ >= 0; }
  /// Sends a text whole; false when it does not get through.
  bool write(std::string_view text);
  /// The next line that comes, without its end; nothing at the end and when the time is up.
  std::optional<std::string> readLine();
  /// Whether the time was up before everything was sent and read.
  bool timedOut() const { return timedOut_; }

 private:
  bool waitFor(short events);

  /// On the clock of HostAbsoluteTime.
  const double deadline_;
  int socket_ = -1;
  bool timedOut_ = false;
  std::string received_;
};

}  // namespace desktop
