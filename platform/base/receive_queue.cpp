#include "platform/base/receive_queue.h"

#include <sys/socket.h>
#include <unistd.h>

#include <array>
#include <cstring>
#include <map>

#include "platform/base/port_names.h"

namespace base {
namespace {

/// Far longer than any message; of a longer one the rest is lost, and it is not trusted.
constexpr std::size_t kLongest = 256;

/// Port objects point into it, so its entries stay where they are.
std::map<mach_port_t, ReceiveQueue>& queues() {
  static auto& all = *new std::map<mach_port_t, ReceiveQueue>;
  return all;
}

/// The credentials that the kernel has put beside a datagram.
std::optional<ucred> senderOf(msghdr& datagram) {
  const cmsghdr* control = CMSG_FIRSTHDR(&datagram);
  if (control == nullptr) return std::nullopt;
  if (control->cmsg_level != SOL_SOCKET || control->cmsg_type != SCM_CREDENTIALS) return std::nullopt;
  ucred sender{};
  std::memcpy(&sender, CMSG_DATA(control), sizeof sender);
  return sender;
}

/// What comes next from the socket, trusted when this user or root has sent it.
std::optional<Datagram> receive(int socket, uid_t user) {
  std::array<std::byte, kLongest> bytes{};
  iovec body{.iov_base = bytes.data(), .iov_len = bytes.size()};
  // Room for the credentials, which come first, and for nothing else: descriptors that somebody attached do
  // not fit, and the kernel closes them.
  alignas(cmsghdr) std::array<char, CMSG_SPACE(sizeof(ucred))> control{};
  msghdr datagram{};
  datagram.msg_iov = &body;
  datagram.msg_iovlen = 1;
  datagram.msg_control = control.data();
  datagram.msg_controllen = control.size();
  const ssize_t length = recvmsg(socket, &datagram, MSG_DONTWAIT | MSG_CMSG_CLOEXEC);
  if (length < 0) return std::nullopt;
  Datagram received{.bytes = {bytes.begin(), bytes.begin() + length}};
  if (const auto sender = senderOf(datagram)) {
    received.sender = sender->pid;
    const bool friendly = sender->uid == user || sender->uid == 0;
    received.trusted = friendly && (datagram.msg_flags & MSG_TRUNC) == 0;
  }
  return received;
}

}  // namespace

ReceiveQueue::ReceiveQueue(FileDescriptor socket)
    : socket_(std::move(socket)), owner_(getpid()), user_(geteuid()) {}

bool ReceiveQueue::isOurs() const { return owner_ == getpid(); }

std::optional<Datagram> ReceiveQueue::take() {
  if (readAhead_.empty()) return receive(socket_.get(), user_);
  Datagram oldest = std::move(readAhead_.front());
  readAhead_.pop_front();
  return oldest;
}

bool ReceiveQueue::drain() {
  const std::size_t before = readAhead_.size();
  while (auto datagram = receive(socket_.get(), user_)) readAhead_.push_back(std::move(*datagram));
  return readAhead_.size() > before;
}

ReceiveQueue* receiveQueue(mach_port_t name) {
  const auto found = queues().find(name);
  return found != queues().end() && found->second.isOurs() ? &found->second : nullptr;
}

void openReceiveQueue(mach_port_t name, FileDescriptor socket) {
  queues().insert_or_assign(name, ReceiveQueue(std::move(socket)));
  makeRoom = [](mach_port_t port) {
    ReceiveQueue* own = receiveQueue(port);
    return own != nullptr && own->drain();
  };
}

}  // namespace base
