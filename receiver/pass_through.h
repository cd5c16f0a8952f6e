// The receiver's end of the connection to the helper that hands keys on to the desktop.
#pragma once

#include <chrono>
#include <cstdint>
#include <set>
#include <string>
#include <utility>

#include "platform/base/file_descriptor.h"
#include "receiver/holds.h"

namespace receiver {

class PassThrough {
 public:
  /// `socket` is where the helper listens.
  explicit PassThrough(std::string socket) : socket_(std::move(socket)) {}

  /// Connects, so that the desktop knows the helper's device before a key comes. False where there is no
  /// helper; whether it serves this user it says later.
  bool open();

  /// Whether the helper has said that it serves this user, or says so within this time. To be asked once of a
  /// connection.
  bool serves(std::chrono::milliseconds patience);

  /// Ends the connection, and with it whatever is pressed.
  void close();

  /// Hands a press on, if it is of a key that is; false otherwise.
  bool press(Key key);

  /// Hands the release of a press on that was handed on.
  void release(Key key);

  /// Releases what is pressed on a device that is gone.
  void releaseDevice(int device);

 private:
  bool send(std::uint16_t key, std::uint16_t value);

  std::string socket_;
  base::FileDescriptor connection_;
  std::set<Key> pressed_;
};

}  // namespace receiver
