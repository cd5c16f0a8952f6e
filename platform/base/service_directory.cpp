#include "platform/base/service_directory.h"

#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>

namespace base {
namespace {

/// An environment variable that holds an absolute path.
std::optional<std::string> directoryFromEnvironment(const char* variable) {
  const char* value = std::getenv(variable);
  if (value == nullptr || value[0] != '/') return std::nullopt;
  return value;
}

bool isOwnDirectory(const std::string& path, struct stat& status) {
  return lstat(path.c_str(), &status) == 0 && S_ISDIR(status.st_mode) && status.st_uid == geteuid();
}

}  // namespace

std::optional<std::string> serviceDirectory(bool create) {
  if (auto given = directoryFromEnvironment("XDG_RUNTIME_DIR")) return given;

  struct stat status {};
  const std::string user = std::to_string(geteuid());
  std::string session = "/run/user/" + user;
  if (isOwnDirectory(session, status)) return session;

  std::string own = directoryFromEnvironment("TMPDIR").value_or("/tmp") + "/kvd-" + user;
  if (create) mkdir(own.c_str(), 0700);
  // Anybody may have put something else there first, so what counts is what is there now.
  if (!isOwnDirectory(own, status) || (status.st_mode & 07777) != 0700) return std::nullopt;
  return own;
}

std::optional<sockaddr_un> serviceAddress(const std::string& directory, std::string_view service) {
  if (service.empty() || service == "." || service == ".." || service.find('/') != std::string_view::npos) {
    return std::nullopt;
  }
  const std::string path = directory + "/" + std::string(service);
  sockaddr_un address{};
  if (path.size() >= sizeof address.sun_path) return std::nullopt;
  address.sun_family = AF_UNIX;
  std::ranges::copy(path, address.sun_path);
  return address;
}

}  // namespace base
