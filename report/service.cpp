#include "report/service.h"

#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>
#include <system_error>

#include "daemon/kvd.h"
#include "messages/kvd_messages.h"
#include "platform/base/failure.h"
#include "platform/base/service_directory.h"

namespace report {

namespace {

namespace fs = std::filesystem;

/// How a descriptor of the socket that is bound there looks in /proc; empty where none is.
std::string linkOf(const std::string& path) {
  std::ifstream sockets("/proc/net/unix");
  // Anybody may make as many sockets as the kernel lets them.
  constexpr int kMostSockets = 100'000;
  std::string line;
  for (int i = 0; i < kMostSockets && std::getline(sockets, line); ++i) {
    if (!line.ends_with(" " + path)) continue;
    std::istringstream fields(line);
    std::string inode;
    for (int field = 0; field < 7; ++field) fields >> inode;
    return "socket:[" + inode + "]";
  }
  return {};
}

bool hasOpen(const fs::path& process, const std::string& link) {
  std::error_code error;
  for (fs::directory_iterator it(process / "fd", error), end; !error && it != end; it.increment(error)) {
    std::error_code unreadable;
    if (fs::read_symlink(it->path(), unreadable) == link) return true;
  }
  return false;
}

bool isNumber(const std::string& text) { return text.find_first_not_of("0123456789") == std::string::npos; }

Object listenersOn(const std::string& path) {
  Object list = Object::array();
  const std::string link = linkOf(path);
  if (link.empty()) return list;
  std::error_code error;
  for (fs::directory_iterator it("/proc", error), end; !error && it != end; it.increment(error)) {
    const std::string process = it->path().filename();
    if (!isNumber(process) || !hasOpen(it->path(), link)) continue;
    std::ifstream file(it->path() / "comm");
    std::string name;
    std::getline(file, name);
    list.push_back({{"name", name}, {"process", std::stoi(process)}});
  }
  return list;
}

}  // namespace

Object describeService() {
  const auto directory = base::serviceDirectory(base::Side::Sends);
  const auto address = directory ? base::serviceAddress(*directory, kKVDServiceName) : std::nullopt;
  if (!address)
    return {{"socket", nullptr}, {"listeners", Object::array()}, {"obstacle", base::lastFailure()}};
  const std::string path = address->sun_path;
  return {{"socket", path}, {"listeners", listenersOn(path)}, {"obstacle", ""}};
}

}  // namespace report
