#include "receiver/pass_through.h"

#include <sys/socket.h>
#include <sys/un.h>

#include <algorithm>

#include "receiver/pass_through/protocol.h"

namespace receiver {

bool PassThrough::open() {
  if (connection_) return true;
  sockaddr_un address{};
  if (socket_.size() >= sizeof address.sun_path) return false;
  address.sun_family = AF_UNIX;
  std::ranges::copy(socket_, address.sun_path);
  base::FileDescriptor connection(socket(AF_UNIX, SOCK_SEQPACKET | SOCK_NONBLOCK | SOCK_CLOEXEC, 0));
  if (connect(connection.get(), reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0)
    return false;
  connection_ = std::move(connection);
  return true;
}

void PassThrough::close() {
  connection_ = base::FileDescriptor();
  pressed_.clear();
}

bool PassThrough::send(std::uint16_t key, std::uint16_t value) {
  const pass_through::KeyPress press{key, value};
  return connection_ && ::send(connection_.get(), &press, sizeof press, MSG_NOSIGNAL) == sizeof press;
}

bool PassThrough::press(Key key) {
  if (!pass_through::handsOn(key.code)) return false;
  bool sent = send(key.code, 1);
  if (!sent) {
    // A helper that has ended is started anew by the next connection.
    close();
    sent = open() && send(key.code, 1);
  }
  if (sent) pressed_.insert(key);
  return sent;
}

void PassThrough::release(Key key) {
  if (pressed_.erase(key) > 0) send(key.code, 0);
}

void PassThrough::releaseDevice(int device) {
  for (auto it = pressed_.begin(); it != pressed_.end();) {
    const Key key = *it++;
    if (key.device == device) release(key);
  }
}

}  // namespace receiver
