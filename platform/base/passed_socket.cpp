#include "platform/base/passed_socket.h"

#include <fcntl.h>
#include <sys/socket.h>
#include <unistd.h>

#include <charconv>
#include <cstdlib>
#include <optional>
#include <string>

namespace base {
namespace {

/// The first passed descriptor; the others follow.
constexpr int kFirstPassed = 3;

std::optional<std::string> takeVariable(const char* name) {
  const char* value = std::getenv(name);
  if (value == nullptr) return std::nullopt;
  std::string text = value;
  unsetenv(name);
  return text;
}

/// The whole text as a number; -1 when it is none.
int numberOf(const std::optional<std::string>& text) {
  int number = -1;
  if (!text) return -1;
  const char* end = text->data() + text->size();
  const auto [stop, error] = std::from_chars(text->data(), end, number);
  return error == std::errc() && stop == end ? number : -1;
}

/// Where in the list of names, separated by colons, the service stands: under its own name or under that of
/// its socket unit. -1 when it does not.
int positionOf(std::string_view service, std::string_view names) {
  for (int position = 0;; ++position) {
    const std::string_view name = names.substr(0, names.find(':'));
    if (name == service || (name.starts_with(service) && name.substr(service.size()) == ".socket")) {
      return position;
    }
    if (name.size() == names.size()) return -1;
    names.remove_prefix(name.size() + 1);
  }
}

bool isDatagramSocket(int descriptor) {
  int domain = 0;
  int type = 0;
  socklen_t size = sizeof(int);
  return getsockopt(descriptor, SOL_SOCKET, SO_DOMAIN, &domain, &size) == 0 && domain == AF_UNIX &&
         getsockopt(descriptor, SOL_SOCKET, SO_TYPE, &type, &size) == 0 && type == SOCK_DGRAM;
}

}  // namespace

FileDescriptor passedSocket(std::string_view service) {
  const int process = numberOf(takeVariable("LISTEN_PID"));
  const int count = numberOf(takeVariable("LISTEN_FDS"));
  const auto names = takeVariable("LISTEN_FDNAMES");
  if (process != getpid() || count < 1) return FileDescriptor();

  for (int i = 0; i < count && fcntl(kFirstPassed + i, F_SETFD, FD_CLOEXEC) == 0; ++i) {
  }
  const int position = names ? positionOf(service, *names) : count == 1 ? 0 : -1;
  if (position < 0 || position >= count || !isDatagramSocket(kFirstPassed + position))
    return FileDescriptor();
  return FileDescriptor(kFirstPassed + position);
}

}  // namespace base
