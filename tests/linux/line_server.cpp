#include "tests/linux/line_server.h"

#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <cstdio>

namespace {

int listening = -1;
int client = -1;
std::string received;

}  // namespace

void listenForLines(const std::string& path) {
  sockaddr_un address{.sun_family = AF_UNIX, .sun_path = {}};
  path.copy(address.sun_path, sizeof address.sun_path - 1);
  std::remove(path.c_str());
  close(listening);
  listening = socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0);
  if (bind(listening, reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0 ||
      listen(listening, 8) != 0) {
    std::perror(path.c_str());
  }
}

int lineDescriptor() { return client >= 0 ? client : listening; }

void serveLines(const std::function<std::string(const std::string& line)>& answer) {
  for (;;) {
    if (client < 0) client = accept4(listening, nullptr, nullptr, SOCK_CLOEXEC | SOCK_NONBLOCK);
    char part[4096];
    const ssize_t size = recv(client, part, sizeof part, 0);
    if (size < 0) return;
    received.append(part, static_cast<std::size_t>(size));
    for (std::size_t end; (end = received.find('\n')) != std::string::npos; received.erase(0, end + 1)) {
      const std::string text = answer(received.substr(0, end));
      // A client that does not wait for the answer has gone.
      send(client, text.data(), text.size(), MSG_NOSIGNAL);
    }
    if (size > 0) continue;
    close(client);
    client = -1;
    received.clear();
  }
}
