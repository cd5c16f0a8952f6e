#include "platform/base/port.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/file.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstring>
#include <fstream>
#include <string>
#include <vector>

#include "platform/base/failure.h"
#include "platform/base/port_names.h"
#include "platform/base/run_loop.h"
#include "platform/base/sockets.h"
#include "tests/temporary_directory.h"

namespace {

constexpr char kService[] = "com.tarn.test";
constexpr std::size_t kLargest = 48;
constexpr uid_t kStranger = 54321;
constexpr gid_t kSame = static_cast<gid_t>(-1);

kern_return_t checkIn(mach_port_t& port, const char* service = kService) {
  return bootstrap_check_in(base::kBootstrapPort, service, &port);
}
kern_return_t lookUp(mach_port_t& port, const char* service = kService) {
  return bootstrap_look_up(base::kBootstrapPort, service, &port);
}

mach_msg_return_t send(mach_port_t port, mach_msg_id_t id, mach_msg_size_t size = kLargest,
                       mach_msg_timeout_t timeout = 0,
                       mach_msg_option_t option = MACH_SEND_MSG | MACH_SEND_TIMEOUT) {
  mach_msg_header_t message[3] = {{MACH_MSG_TYPE_COPY_SEND | MACH_MSGH_BITS_COMPLEX, 0, port, 9, 9, id}};
  return mach_msg(message, option, size, 0, MACH_PORT_NULL, timeout, MACH_PORT_NULL);
}

/// Runs code in a process of its own, which ends by exit().
pid_t inChild(const std::function<bool()>& code) {
  const pid_t child = fork();
  if (child == 0) std::exit(code() ? EXIT_SUCCESS : EXIT_FAILURE);
  return child;
}
bool succeeded(pid_t child) {
  int status = 0;
  return waitpid(child, &status, 0) == child && status == EXIT_SUCCESS;
}

/// Looks the service up and sends one message of 48 bytes.
bool sendOne() {
  mach_port_t found = MACH_PORT_NULL;
  return lookUp(found) == KERN_SUCCESS && send(found, 601) == MACH_MSG_SUCCESS;
}

/// Receives on a checked-in port.
struct Receiver {
  explicit Receiver(mach_port_t name) : port(HostCreatePort(name, kLargest, received, this)) {
    HostRunLoopAddSource(HostRunLoopCurrent(), HostCreatePortSource(port, 0), HostRunLoopMode::Default);
  }
  /// Runs the loop until nothing waits and so many messages in all were delivered or dropped.
  base::PortCounts take(std::size_t count) {
    const auto wait = [this, count](auto) {
      const base::PortCounts counts = base::portCounts(port);
      counts.delivered + counts.dropped < count ? base::waitForSources(std::nullopt)
                                                : HostRunLoopStop(HostRunLoopCurrent());
    };
    base::setTimeSource({.now = {}, .wait = wait, .sleep = {}});
    HostRunLoopRun();
    return base::portCounts(port);
  }
  static void received(HostPortRef, void* message, std::size_t, void* context) {
    static_cast<Receiver*>(context)->headers.push_back(*static_cast<mach_msg_header_t*>(message));
  }
  std::vector<mach_msg_header_t> headers;
  const HostPortRef port;
};

class Ports : public testing::Test {
 protected:
  /// A socket bound where the service's is looked for.
  int boundSocket() const {
    const int fd = socket(AF_UNIX, SOCK_DGRAM | SOCK_CLOEXEC, 0);
    EXPECT_EQ(bind(fd, reinterpret_cast<const sockaddr*>(&address), sizeof address), 0);
    return fd;
  }
  ino_t inode() const {
    struct stat status {};
    return lstat(path.c_str(), &status) == 0 ? status.st_ino : 0;
  }

  const TemporaryDirectory directory;
  const std::filesystem::path path = directory.path / kService;
  const sockaddr_un address = *base::serviceAddress(directory.path, kService);
  mach_port_t port = MACH_PORT_NULL;
};

TEST_F(Ports, MessageArrivesFromAnotherProcessAsTheKernelLeavesIt) {
  ASSERT_EQ(checkIn(port), KERN_SUCCESS);
  EXPECT_FALSE(HostCreatePort(port + 1, kLargest, Receiver::received, nullptr));
  const pid_t sender = inChild(sendOne);
  Receiver receiver(port);
  receiver.take(1);
  EXPECT_TRUE(succeeded(sender));
  const mach_msg_header_t expected{MACH_MSGH_BITS_COMPLEX | 17 << 8, 48, MACH_PORT_NULL, port, 0, 601};
  EXPECT_EQ(std::memcmp(&receiver.headers.at(0), &expected, sizeof expected), 0);
}

TEST_F(Ports, PassedSocketIsTakenByNameWithWhatWaitsInIt) {
  for (const std::string names : {"", "com.tarn.test", "a:com.tarn.test.socket", "other"}) {
    std::filesystem::remove(path);
    const int passed = boundSocket();
    EXPECT_TRUE(succeeded(inChild(sendOne)));
    const pid_t receiver = inChild([&] {
      dup2(passed, 3);
      dup2(passed, 4);
      setenv("LISTEN_PID", std::to_string(getpid()).c_str(), 1);
      setenv("LISTEN_FDS", names.empty() ? "1" : "2", 1);
      if (!names.empty()) setenv("LISTEN_FDNAMES", names.c_str(), 1);
      const kern_return_t result = checkIn(port);
      if (getenv("LISTEN_PID") != nullptr || fcntl(3, F_GETFD) != FD_CLOEXEC) return false;
      if (names == "other") return result == BOOTSTRAP_SERVICE_ACTIVE;
      return result == KERN_SUCCESS && Receiver(port).take(1).delivered == 1;
    });
    EXPECT_TRUE(succeeded(receiver) && inode() != 0) << names;
    close(passed);
  }
}

TEST_F(Ports, ForeignShapesAreDroppedOrLeftToTheDecoder) {
  ASSERT_EQ(checkIn(port), KERN_SUCCESS);
  Receiver receiver(port);
  const base::FileDescriptor raw = base::connectedSocket(address);
  const std::string bytes(100, 'x');
  for (const std::size_t size : {0u, 23u, 24u, 47u, 48u, 49u, 100u}) write(raw.get(), bytes.data(), size);
  EXPECT_EQ(receiver.take(7).dropped, 4u);
  EXPECT_EQ(receiver.headers.at(0).msgh_size + receiver.headers.at(1).msgh_size * 100, 4724u);

  int ends[2];
  ASSERT_EQ(pipe2(ends, O_CLOEXEC), 0);
  alignas(cmsghdr) char control[CMSG_SPACE(sizeof(int))] = {};
  iovec body{.iov_base = const_cast<char*>(bytes.data()), .iov_len = 24};
  const msghdr withDescriptor{nullptr, 0, &body, 1, control, sizeof control, 0};
  *CMSG_FIRSTHDR(&withDescriptor) = {
      .cmsg_len = CMSG_LEN(sizeof(int)), .cmsg_level = SOL_SOCKET, .cmsg_type = SCM_RIGHTS};
  std::memcpy(CMSG_DATA(CMSG_FIRSTHDR(&withDescriptor)), &ends[1], sizeof(int));
  EXPECT_EQ(sendmsg(raw.get(), &withDescriptor, 0), 24);
  close(ends[1]);
  EXPECT_EQ(receiver.take(8).delivered, 4u);
  EXPECT_EQ(read(ends[0], control, 1), 0);  // Nobody holds the other end.

  if (geteuid() != 0) GTEST_SKIP() << "only root can send as somebody else";
  std::filesystem::permissions(directory.path, std::filesystem::perms::all);
  std::filesystem::permissions(path, std::filesystem::perms::all);
  const pid_t stranger =
      inChild([&] { return setuid(kStranger) == 0 && write(raw.get(), bytes.data(), 24) == 24; });
  EXPECT_EQ(receiver.take(9).dropped, 5u);
  EXPECT_TRUE(succeeded(stranger));
}

TEST_F(Ports, RootReachesEverybody) {
  if (geteuid() != 0) GTEST_SKIP() << "it takes root";
  ASSERT_EQ(chown(directory.path.c_str(), kStranger, kSame), 0);
  int ends[2];
  ASSERT_EQ(pipe(ends), 0);
  const pid_t user = inChild([&] {
    return setuid(kStranger) == 0 && checkIn(port) == KERN_SUCCESS && write(ends[1], "x", 1) == 1 &&
           Receiver(port).take(1).delivered == 1;
  });
  close(ends[1]);
  char byte = 0;
  ASSERT_EQ(read(ends[0], &byte, 1), 1);
  if (!sendOne()) kill(user, SIGKILL);
  EXPECT_TRUE(succeeded(user));
}

TEST_F(Ports, FullQueueTimesOutAndADeadReceiverEndsTheWait) {
  int ends[2];
  ASSERT_EQ(socketpair(AF_UNIX, SOCK_STREAM, 0, ends), 0);
  char byte = 'x';
  const pid_t receiver = inChild([&] {
    return checkIn(port) == KERN_SUCCESS && write(ends[1], &byte, 1) == 1 && read(ends[1], &byte, 1) == 1;
  });
  ASSERT_EQ(read(ends[0], &byte, 1), 1);
  ASSERT_EQ(lookUp(port), KERN_SUCCESS);
  while (send(port, 600, 24, 1) == MACH_MSG_SUCCESS) continue;
  EXPECT_EQ(send(port, 600, 24, 1), MACH_SEND_TIMED_OUT);
  ASSERT_EQ(write(ends[0], &byte, 1), 1);
  EXPECT_EQ(send(port, 600, 24, 0, MACH_SEND_MSG), MACH_SEND_INVALID_DEST);
  EXPECT_EQ(send(port, 600), MACH_SEND_INVALID_DEST);
  EXPECT_TRUE(succeeded(receiver));
}

TEST_F(Ports, SenderNeverWaitsForItself) {
  ASSERT_EQ(checkIn(port), KERN_SUCCESS);
  mach_port_t found = MACH_PORT_NULL;
  ASSERT_EQ(lookUp(found), KERN_SUCCESS);
  EXPECT_EQ(found, port);
  constexpr mach_msg_id_t count = 2000;
  for (mach_msg_id_t id = 0; id < count; ++id) ASSERT_EQ(send(found, id), MACH_MSG_SUCCESS);
  Receiver receiver(port);
  EXPECT_EQ(receiver.take(count).delivered, std::size_t{count});
  mach_msg_id_t next = 0;
  for (const mach_msg_header_t& header : receiver.headers) EXPECT_EQ(header.msgh_id, next++);
}

TEST_F(Ports, NobodyThereAndWrongArguments) {
  mach_port_t found = 77;
  EXPECT_EQ(lookUp(found), BOOTSTRAP_UNKNOWN_SERVICE);
  close(boundSocket());
  EXPECT_EQ(lookUp(found), BOOTSTRAP_UNKNOWN_SERVICE);
  EXPECT_EQ(found, 77u);
  const std::string tooLong(200, 'n');
  for (const char* name : {"../x", "", "..", tooLong.c_str()}) {
    EXPECT_TRUE(checkIn(found, name) != KERN_SUCCESS && lookUp(found, name) != KERN_SUCCESS) << name;
  }
  for (const mach_port_t nowhere :
       {MACH_PORT_NULL, mach_task_self(), base::kBootstrapPort, mach_port_t{99}}) {
    EXPECT_EQ(send(nowhere, 600), MACH_SEND_INVALID_DEST) << nowhere;
  }
  EXPECT_EQ(send(port, 600, 23), MACH_SEND_MSG_TOO_SMALL);
  EXPECT_NE(task_get_special_port(mach_task_self(), 3, &found), KERN_SUCCESS);
  EXPECT_EQ(task_get_special_port(mach_task_self(), TASK_BOOTSTRAP_PORT, &found), KERN_SUCCESS);
  EXPECT_EQ(found, base::kBootstrapPort);
}

TEST_F(Ports, SocketFileIsReplacedKeptOrRemovedAsItsOwnerLives) {
  close(boundSocket());  // Left by a process that is gone.
  const pid_t daemon = inChild([&] {
    if (checkIn(port) != KERN_SUCCESS || checkIn(port) != BOOTSTRAP_SERVICE_ACTIVE) return false;
    const ino_t own = inode();
    const pid_t other = inChild([&] { return checkIn(port) == BOOTSTRAP_SERVICE_ACTIVE; });
    const auto mode = std::filesystem::status(path).permissions();
    return succeeded(other) && inode() == own && mode == std::filesystem::perms(0600);
  });
  EXPECT_TRUE(succeeded(daemon) && inode() == 0);

  const base::FileDescriptor holder(open(directory.path.c_str(), O_RDONLY | O_CLOEXEC));
  ASSERT_EQ(flock(holder.get(), LOCK_EX), 0);
  EXPECT_EQ(checkIn(port), KERN_FAILURE) << "who holds the lock is not waited for";
  flock(holder.get(), LOCK_UN);
  std::ofstream(path) << "no socket";
  EXPECT_EQ(checkIn(port), KERN_FAILURE);
  EXPECT_EQ(std::filesystem::file_size(path), 9u);
}

TEST_F(Ports, NeitherSideTrustsWhatOthersMayHaveMade) {
  const uid_t us = geteuid();
  const struct {
    mode_t mode;
    uid_t directoryOwner;
    uid_t socketOwner;
    bool receives;
    bool sends;
  } cases[] = {
      {0700, us, us, true, true},
      {0755, us, us, true, true},
      {0720, us, us, false, false},
      {0702, us, us, false, false},
      {0700, us, kStranger, true, false},
      {0700, kStranger, us, false, false},
      {0700, kStranger, kStranger, false, true},  // Only root sees these.
  };
  const base::FileDescriptor bound(boundSocket());
  for (const auto& [mode, directoryOwner, socketOwner, receives, sends] : cases) {
    if (chown(directory.path.c_str(), directoryOwner, kSame) != 0) continue;
    if (chown(path.c_str(), socketOwner, kSame) != 0) continue;
    ASSERT_EQ(chmod(directory.path.c_str(), mode), 0);
    EXPECT_EQ(base::serviceDirectory(base::Side::Receives).has_value(), receives) << base::lastFailure();
    EXPECT_EQ(lookUp(port) == KERN_SUCCESS, sends) << base::lastFailure();
  }
}

TEST_F(Ports, PrivateDirectoryMustBeOurs) {
  setenv("XDG_RUNTIME_DIR", "relative", 1);
  setenv("TMPDIR", directory.path.c_str(), 1);
  const std::string user = std::to_string(geteuid());
  if (std::filesystem::exists("/run/user/" + user)) GTEST_SKIP() << "the session has a directory";
  const std::filesystem::path own = directory.path / ("kvd-" + user);
  EXPECT_EQ(base::serviceDirectory(base::Side::Receives), own);
  std::filesystem::permissions(own, std::filesystem::perms::all);
  EXPECT_FALSE(base::serviceDirectory(base::Side::Receives));
  std::filesystem::remove(own);
  std::filesystem::create_directory_symlink(directory.path, own);
  EXPECT_FALSE(base::serviceDirectory(base::Side::Receives));
}

}  // namespace
