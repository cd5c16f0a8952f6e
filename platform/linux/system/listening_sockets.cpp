#include "platform/linux/system/listening_sockets.h"

#include <dirent.h>
#include <linux/netlink.h>
#include <linux/rtnetlink.h>
#include <linux/sock_diag.h>
#include <linux/unix_diag.h>
#include <netinet/tcp.h>
#include <sys/socket.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdint>
#include <memory>
#include <optional>
#include <string_view>

#include "platform/base/file_descriptor.h"

namespace linux::system {

namespace {

using Inode = std::uint32_t;

/// No player has that many.
constexpr std::size_t kMostSockets = 1024;

struct DirectoryCloser {
  void operator()(DIR* directory) const { closedir(directory); }
};

/// The inode in "socket:[42]", which a link of /proc says.
std::optional<Inode> socketInode(const std::string& link) {
  constexpr std::string_view kBeginning = "socket:[";
  std::array<char, 64> target{};
  const ssize_t length = readlink(link.c_str(), target.data(), target.size());
  std::string_view text(target.data(), static_cast<std::size_t>(std::max<ssize_t>(length, 0)));
  if (!text.starts_with(kBeginning)) return std::nullopt;
  text.remove_prefix(kBeginning.size());
  Inode inode = 0;
  if (std::from_chars(text.data(), text.data() + text.size(), inode).ec != std::errc()) return std::nullopt;
  return inode;
}

/// The process's sockets, of whatever kind.
std::vector<Inode> socketsOf(pid_t process) {
  std::vector<Inode> sockets;
  const std::string path = "/proc/" + std::to_string(process) + "/fd";
  const std::unique_ptr<DIR, DirectoryCloser> directory(opendir(path.c_str()));
  if (directory == nullptr) return sockets;
  while (const dirent* entry = readdir(directory.get())) {
    const auto inode = socketInode(path + "/" + entry->d_name);
    if (inode && sockets.size() < kMostSockets) sockets.push_back(*inode);
  }
  return sockets;
}

bool askFor(const base::FileDescriptor& kernel, Inode inode) {
  struct {
    nlmsghdr header;
    unix_diag_req request;
  } message{};
  message.header.nlmsg_len = sizeof message;
  message.header.nlmsg_type = SOCK_DIAG_BY_FAMILY;
  message.header.nlmsg_flags = NLM_F_REQUEST;
  message.request.sdiag_family = AF_UNIX;
  message.request.udiag_states = 1U << TCP_LISTEN;
  message.request.udiag_ino = inode;
  message.request.udiag_show = UDIAG_SHOW_NAME;
  std::ranges::fill(message.request.udiag_cookie, UINT32_MAX);  // any
  return send(kernel.get(), &message, sizeof message, 0) == sizeof message;
}

/// The path in the kernel's answer; empty for an error and for every socket that is none of those asked for.
std::string pathIn(const char* answer, std::size_t size) {
  const auto* const header = reinterpret_cast<const nlmsghdr*>(answer);
  constexpr std::size_t kFixed = NLMSG_SPACE(sizeof(unix_diag_msg));
  if (size < kFixed || header->nlmsg_type != SOCK_DIAG_BY_FAMILY || header->nlmsg_len > size) return {};
  const auto* const told = reinterpret_cast<const unix_diag_msg*>(answer + NLMSG_HDRLEN);
  if (told->udiag_type != SOCK_STREAM || told->udiag_state != TCP_LISTEN) return {};
  for (std::size_t at = kFixed; at + sizeof(rtattr) <= header->nlmsg_len;) {
    const auto* const attribute = reinterpret_cast<const rtattr*>(answer + at);
    if (attribute->rta_len < sizeof(rtattr) || at + attribute->rta_len > header->nlmsg_len) return {};
    const std::string_view value(answer + at + sizeof(rtattr), attribute->rta_len - sizeof(rtattr));
    if (attribute->rta_type == UNIX_DIAG_NAME && value.starts_with('/')) {
      return std::string(value.substr(0, value.find('\0')));
    }
    at += RTA_ALIGN(attribute->rta_len);
  }
  return {};
}

}  // namespace

std::vector<std::string> listeningSockets(pid_t process) {
  std::vector<std::string> paths;
  const base::FileDescriptor kernel(socket(AF_NETLINK, SOCK_DGRAM | SOCK_CLOEXEC, NETLINK_SOCK_DIAG));
  if (!kernel) return paths;
  for (const Inode inode : socketsOf(process)) {
    alignas(nlmsghdr) std::array<char, 1024> answer{};
    // The kernel has answered by the time that the request is sent.
    if (!askFor(kernel, inode)) continue;
    const ssize_t size = recv(kernel.get(), answer.data(), answer.size(), MSG_DONTWAIT);
    if (size <= 0) continue;
    std::string path = pathIn(answer.data(), static_cast<std::size_t>(size));
    if (!path.empty()) paths.push_back(std::move(path));
  }
  return paths;
}

}  // namespace linux::system
