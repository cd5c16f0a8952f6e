#include "platform/base/service_directory.h"

#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <cstring>

#include "platform/base/failure.h"

namespace base {
namespace {

/// An environment variable that holds an absolute path.
std::optional<std::string> directoryFromEnvironment(const char* variable) {
  const char* value = std::getenv(variable);
  if (value == nullptr || value[0] != '/') return std::nullopt;
  return value;
}

/// What keeps a directory from being used; empty when nothing does.
std::string objectionTo(const struct stat& directory, Side side) {
  if (!S_ISDIR(directory.st_mode)) return "it is no directory";
  const bool maySendToAll = side == Side::Sends && geteuid() == 0;
  if (directory.st_uid != geteuid() && !maySendToAll) return "it is another user's";
  if ((directory.st_mode & (S_IWGRP | S_IWOTH)) != 0) return "others may write into it";
  return {};
}

using Look = int (*)(const char* path, struct stat* status);

/// The directory if it will do. One that is not there does for a sender, who finds nobody in it.
std::optional<std::string> checked(std::string path, Side side, Look look) {
  struct stat status {};
  std::string objection;
  if (look(path.c_str(), &status) == 0) {
    objection = objectionTo(status, side);
  } else if (side == Side::Receives || errno != ENOENT) {
    objection = std::strerror(errno);
  }
  if (objection.empty()) return path;
  noteFailure("no socket can be in " + path + ": " + objection +
              "; XDG_RUNTIME_DIR must name a directory of your own (mode 0700)");
  return std::nullopt;
}

}  // namespace

std::optional<std::string> serviceDirectory(Side side) {
  if (const auto given = directoryFromEnvironment("XDG_RUNTIME_DIR")) return checked(*given, side, stat);

  const std::string user = std::to_string(geteuid());
  const std::string session = "/run/user/" + user;
  if (access(session.c_str(), F_OK) == 0) return checked(session, side, lstat);

  const std::string own = directoryFromEnvironment("TMPDIR").value_or("/tmp") + "/kvd-" + user;
  if (side == Side::Receives) mkdir(own.c_str(), 0700);
  // Anybody may have put something else there first, so what counts is what is there now.
  return checked(own, side, lstat);
}

std::optional<sockaddr_un> serviceAddress(const std::string& directory, std::string_view service) {
  if (service.empty() || service == "." || service == ".." || service.find('/') != std::string_view::npos) {
    return std::nullopt;
  }
  const std::string path = directory + "/" + std::string(service);
  sockaddr_un address{};
  if (path.size() >= sizeof address.sun_path) {
    noteFailure("the path of a socket cannot be as long as " + path +
                "; set XDG_RUNTIME_DIR to a shorter one");
    return std::nullopt;
  }
  address.sun_family = AF_UNIX;
  std::ranges::copy(path, address.sun_path);
  return address;
}

}  // namespace base
