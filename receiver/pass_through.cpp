#include "receiver/pass_through.h"

#include <poll.h>
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

bool PassThrough::serves(std::chrono::milliseconds patience) {
  pollfd answer{connection_.get(), POLLIN, 0};
  std::uint8_t word = 0;
  return poll(&answer, 1, static_cast<int>(patience.count())) == 1 &&
         recv(connection_.get(), &word, sizeof word, 0) == sizeof word && word == pass_through::kReady;
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
  if (!pass_through::handsOn(key.code) || !open()) return false;
  bool sent = send(key.code, 1);
  if (!sent && serves(std::chrono::milliseconds(0))) {
    // The next connection starts it anew. One that has refused to serve would refuse again.
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
