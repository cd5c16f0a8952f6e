#include "platform/linux/system/process.h"

#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <charconv>
#include <cstdint>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <sstream>
#include <string_view>
#include <system_error>

namespace linux::system {

namespace {

/// What a link of /proc says; empty where there is none.
std::string linkTarget(const std::string& path) {
  std::array<char, 4096> target{};
  const ssize_t length = readlink(path.c_str(), target.data(), target.size());
  return length > 0 ? std::string(target.data(), static_cast<std::size_t>(length)) : std::string();
}

}  // namespace

std::string executableName(pid_t process) {
  std::string path = linkTarget("/proc/" + std::to_string(process) + "/exe");
  // A program whose package was brought up to date while it runs.
  constexpr std::string_view kReplaced = " (deleted)";
  if (path.ends_with(kReplaced)) path.resize(path.size() - kReplaced.size());
  return path.substr(path.rfind('/') + 1);
}

std::vector<pid_t> ownProcesses() {
  std::vector<pid_t> processes;
  std::error_code error;
  for (std::filesystem::directory_iterator found("/proc", error), end; !error && found != end;
       found.increment(error)) {
    const std::string name = found->path().filename();
    pid_t process = 0;
    const auto [rest, failure] = std::from_chars(name.data(), name.data() + name.size(), process);
    if (failure != std::errc() || rest != name.data() + name.size()) continue;
    struct stat owned {};
    if (stat(found->path().c_str(), &owned) == 0 && owned.st_uid == getuid()) processes.push_back(process);
  }
  return processes;
}

std::uint32_t startTime(pid_t process) {
  constexpr int kFieldsBefore =
      19;  // between the name, which may hold anything but ends with the last ')', and it
  std::ifstream file("/proc/" + std::to_string(process) + "/stat");
  const std::string text(std::istreambuf_iterator<char>(file), {});
  const std::size_t end = text.rfind(')');
  if (end == std::string::npos) return 0;
  std::istringstream rest(text.substr(end + 1));
  std::string field;
  for (int i = 0; i < kFieldsBefore; ++i) rest >> field;
  std::uint64_t ticks = 0;
  rest >> ticks;
  return static_cast<std::uint32_t>(ticks);
}

}  // namespace linux::system
