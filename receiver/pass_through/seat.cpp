#include "receiver/pass_through/seat.h"

#include <sys/socket.h>
#include <systemd/sd-login.h>

#include <cerrno>
#include <system_error>

namespace receiver::pass_through {

uid_t peerOf(int connection) {
  ucred peer{};
  socklen_t size = sizeof peer;
  if (getsockopt(connection, SOL_SOCKET, SO_PEERCRED, &peer, &size) != 0) {
    throw std::system_error(errno, std::generic_category(), "the connection");
  }
  return peer.uid;
}

bool mayPress(uid_t user) {
  constexpr int kInFront = 1;
  return user == 0 || sd_uid_is_on_seat(user, kInFront, "seat0") > 0;
}

}  // namespace receiver::pass_through
