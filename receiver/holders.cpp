#include "receiver/holders.h"

#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <string_view>

namespace receiver {
namespace {

namespace fs = std::filesystem;

bool isNumber(const std::string& text) { return text.find_first_not_of("0123456789") == std::string::npos; }

bool hasOpen(const fs::path& process, const std::string& path) {
  std::error_code error;
  for (fs::directory_iterator it(process / "fd", error), end; !error && it != end; it.increment(error)) {
    std::error_code unreadable;
    if (fs::read_symlink(it->path(), unreadable) == path) return true;
  }
  return false;
}

std::string nameOf(const fs::path& process) {
  std::ifstream file(process / "comm");
  std::string name;
  std::getline(file, name);
  return name;
}

}  // namespace

std::string holdersOf(const std::string& path) {
  std::string holders;
  std::error_code error;
  for (fs::directory_iterator it("/proc", error), end; !error && it != end; it.increment(error)) {
    const std::string process = it->path().filename();
    if (!isNumber(process) || process == std::to_string(getpid()) || !hasOpen(it->path(), path)) continue;
    holders += (holders.empty() ? ": " : ", ") + nameOf(it->path()) + " (" + process + ")";
  }
  return holders;
}

}  // namespace receiver
