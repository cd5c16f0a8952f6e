#include "receiver/pass_through/serve.h"

#include <sys/socket.h>

#include <stdexcept>
#include <string>

#include "receiver/pass_through/protocol.h"
#include "receiver/pass_through/seat.h"
#include "receiver/pass_through/uinput.h"

namespace receiver::pass_through {

void serve(int connection, const char* uinput) {
  const uid_t user = peerOf(connection);
  if (!mayPress(user)) {
    throw std::runtime_error("user " + std::to_string(user) + " has no session in front of seat0");
  }
  const base::FileDescriptor device = makeDevice(uinput);
  send(connection, &kReady, sizeof kReady, MSG_NOSIGNAL);
  KeyPress asked{};
  // With MSG_TRUNC the size is the packet's, however much of it there was room for.
  for (ssize_t size = 0; (size = recv(connection, &asked, sizeof asked, MSG_TRUNC)) > 0;) {
    if (size != sizeof asked || !handsOn(asked.key) || asked.value > 1) continue;
    // A release is never refused: it can only be of a press that was not.
    if (asked.value == 1 && !mayPress(user)) continue;
    press(device, asked.key, asked.value);
  }
}

}  // namespace receiver::pass_through
