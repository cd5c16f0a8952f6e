#include "platform/linux/system/process.h"

#include <dirent.h>
#include <unistd.h>

#include <array>
#include <charconv>
#include <cstdint>
#include <fstream>
#include <iterator>
#include <memory>
#include <optional>
#include <set>
#include <sstream>
#include <string_view>

namespace linux::system {

namespace {

using Inode = std::uint64_t;

/// What a link of /proc says; empty where there is none.
std::string linkTarget(const std::string& path) {
  std::array<char, 4096> target{};
  const ssize_t length = readlink(path.c_str(), target.data(), target.size());
  return length > 0 ? std::string(target.data(), static_cast<std::size_t>(length)) : std::string();
}

/// The inode in "socket:[42]".
std::optional<Inode> socketInode(std::string_view target) {
  constexpr std::string_view kBeginning = "socket:[";
  if (!target.starts_with(kBeginning)) return std::nullopt;
  target.remove_prefix(kBeginning.size());
  Inode inode = 0;
  if (std::from_chars(target.data(), target.data() + target.size(), inode).ec != std::errc()) {
    return std::nullopt;
  }
  return inode;
}

struct DirectoryCloser {
  void operator()(DIR* directory) const { closedir(directory); }
};

std::set<Inode> socketsOf(pid_t process) {
  std::set<Inode> sockets;
  const std::string path = "/proc/" + std::to_string(process) + "/fd";
  const std::unique_ptr<DIR, DirectoryCloser> directory(opendir(path.c_str()));
  if (directory == nullptr) return sockets;
  while (const dirent* entry = readdir(directory.get())) {
    if (const auto inode = socketInode(linkTarget(path + "/" + entry->d_name))) sockets.insert(*inode);
  }
  return sockets;
}

}  // namespace

std::string executableName(pid_t process) {
  std::string path = linkTarget("/proc/" + std::to_string(process) + "/exe");
  // A program whose package was brought up to date while it runs.
  constexpr std::string_view kReplaced = " (deleted)";
  if (path.ends_with(kReplaced)) path.resize(path.size() - kReplaced.size());
  return path.substr(path.rfind('/') + 1);
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

std::vector<std::string> listeningSockets(pid_t process) {
  std::vector<std::string> paths;
  const std::set<Inode> sockets = socketsOf(process);
  if (sockets.empty()) return paths;
  // Num RefCount Protocol Flags Type St Inode Path; numbers but the inode are hexadecimal.
  std::ifstream table("/proc/net/unix");
  for (std::string line; std::getline(table, line);) {
    constexpr std::string_view kListening = "00010000";
    constexpr std::string_view kStream = "0001";
    std::istringstream fields(line);
    std::string number, references, protocol, flags, type, state, path;
    Inode inode = 0;
    fields >> number >> references >> protocol >> flags >> type >> state >> inode >> std::ws;
    std::getline(fields, path);
    if (flags == kListening && type == kStream && path.starts_with('/') && sockets.contains(inode)) {
      paths.push_back(path);
    }
  }
  return paths;
}

}  // namespace linux::system
