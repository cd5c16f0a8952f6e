// Datagrams through the real port: the daemon is called as a decoder of this file's own says, and nothing
// else comes of them. An input is one datagram after the other: 1 where it has a descriptor with it, its
// length, its bytes.

#include <fcntl.h>
#include <sys/socket.h>

#include <array>
#include <cstring>
#include <string>
#include <string_view>

#include "daemon/lifecycle.h"
#include "daemon/messages.h"
#include "fuzz/directory.h"
#include "fuzz/fuzz.h"
#include "platform/base/file_descriptor.h"
#include "platform/base/port.h"
#include "platform/base/port_names.h"
#include "platform/base/run_loop.h"

namespace {

using fuzz::require;

std::string sCalled;

std::string call(const char* routine, std::initializer_list<std::int64_t> arguments) {
  std::string text = routine;
  for (const std::int64_t argument : arguments) text += " " + std::to_string(argument);
  return text + "\n";
}

/// What the daemon must be called with for a datagram; nothing where it must drop it.
std::string wanted(std::string_view datagram) {
  const bool littleEndian = datagram.size() > 28 && datagram[28] == 1;
  const auto number = [&](std::size_t at, std::size_t size, bool little) {
    std::uint32_t read = 0;
    for (std::size_t i = 0; i < size; ++i) {
      read = read << 8 | static_cast<std::uint8_t>(datagram[little ? at + size - 1 - i : at + i]);
    }
    return read;
  };
  if (datagram.size() < 24 || (number(0, 4, true) & MACH_MSGH_BITS_COMPLEX) != 0) return {};
  const std::uint32_t id = number(20, 4, true);
  if (id == 600 && datagram.size() == 24) return call("terminate", {});
  if (id == 602 && datagram.size() == 36) return call("lock", {number(32, 1, true)});
  if (id != 601 || datagram.size() != 48) return {};
  return call("button",
              {number(32, 2, littleEndian), number(36, 2, littleEndian), number(40, 2, littleEndian),
               static_cast<std::int32_t>(number(44, 4, littleEndian))});
}

bool send(int socket, std::string_view bytes, bool withDescriptor) {
  alignas(cmsghdr) std::array<char, CMSG_SPACE(sizeof socket)> control{};
  const cmsghdr right{CMSG_LEN(sizeof socket), SOL_SOCKET, SCM_RIGHTS};
  std::memcpy(control.data(), &right, sizeof right);
  std::memcpy(CMSG_DATA(reinterpret_cast<cmsghdr*>(control.data())), &socket, sizeof socket);
  iovec body{.iov_base = const_cast<char*>(bytes.data()), .iov_len = bytes.size()};
  msghdr datagram{};
  datagram.msg_iov = &body;
  datagram.msg_iovlen = 1;
  datagram.msg_control = withDescriptor ? control.data() : nullptr;
  datagram.msg_controllen = withDescriptor ? control.size() : 0;
  return sendmsg(socket, &datagram, MSG_NOSIGNAL | MSG_DONTWAIT) >= 0;
}

struct Service {
  Service() {
    setenv("XDG_RUNTIME_DIR", directory.path.c_str(), 1);
    require(bootstrap_check_in(base::kBootstrapPort, kKVDServiceName, &name) == KERN_SUCCESS,
            "there is a port");
    port = HostCreatePort(name, kKVDLargestRequest, MachMessageReceivedCallback, nullptr);
    HostRunLoopAddSource(HostRunLoopCurrent(), HostCreatePortSource(port, 0), HostRunLoopMode::Default);
  }
  std::uint64_t arrived() const {
    const base::PortCounts counts = base::portCounts(port);
    return counts.delivered + counts.dropped;
  }
  fuzz::Directory directory;
  mach_port_t name = MACH_PORT_NULL;
  HostPortRef port;
};

/// The lowest descriptor that is free.
int nextDescriptor() { return base::FileDescriptor(open("/dev/null", O_RDONLY | O_CLOEXEC)).get(); }

}  // namespace

kern_return_t server_terminate(mach_port_t) { return sCalled += call("terminate", {}), 0; }

kern_return_t server_handlehidevent(mach_port_t, std::uint32_t usagePage, std::uint32_t usage,
                                    std::uint32_t extra, std::int32_t value) {
  return sCalled += call("button", {usagePage, usage, extra, value}), 0;
}

kern_return_t server_setscreenlocked(mach_port_t, std::uint8_t locked) {
  return sCalled += call("lock", {locked}), 0;
}

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static const Service service;
  const int descriptor = nextDescriptor();
  const auto alive = base::aliveByKind();
  std::uint64_t due = service.arrived();
  std::string expected;
  sCalled.clear();
  for (std::string_view rest = fuzz::textOf(data, size); rest.size() >= 2; ++due) {
    const bool withDescriptor = rest[0] == 1;
    std::string datagram(rest.substr(2, static_cast<std::uint8_t>(rest[1])));
    rest.remove_prefix(2 + datagram.size());
    // Longer than the port reads.
    if (datagram.size() == 255) datagram.resize(300);
    expected += wanted(datagram);
    // As mach_msg does where the queue is full.
    while (!send(base::sendSocket(service.name), datagram, withDescriptor)) {
      require(base::makeRoom(service.name), "a queue that is full gets room");
    }
  }
  while (service.arrived() < due) base::runPending();
  require(service.arrived() == due, "each datagram arrives once");
  require(sCalled == expected, "the daemon is called as the datagrams say");
  require(base::aliveByKind() == alive, "a datagram leaves nothing alive");
  require(nextDescriptor() == descriptor, "a datagram leaves no descriptor open");
  return 0;
}
