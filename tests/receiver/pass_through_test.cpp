// The helper that presses keys, and the receiver's end. A FIFO stands in the place of uinput.
#include "receiver/pass_through.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <linux/uinput.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

#include <cstdarg>
#include <list>
#include <stdexcept>
#include <utility>
#include <vector>

#include "receiver/pass_through/protocol.h"
#include "receiver/pass_through/serve.h"
#include "tests/temporary_directory.h"

static int sAnswers;                    // how often the login manager still says that the user is in front
static std::list<unsigned long> sMade;  // the requests that make the device, the keys by their codes

extern "C" int sd_uid_is_on_seat(uid_t, int inFrontOnly, const char* seat) {
  return inFrontOnly == 1 && std::string(seat) == "seat0" && sAnswers-- > 0 ? 1 : 0;
}

extern "C" int ioctl(int, unsigned long request, ...) noexcept {
  va_list arguments;
  va_start(arguments, request);
  sMade.push_back(request == UI_SET_KEYBIT ? va_arg(arguments, unsigned) : request);
  va_end(arguments);
  return 0;
}

namespace receiver {

using Presses = std::vector<std::pair<std::uint16_t, std::uint16_t>>;

struct PassThroughHelper : testing::Test {
  void serve(int connection) const { pass_through::serve(connection, fifo.c_str()); }

  /// What was pressed and released since the last look, each followed by its SYN_REPORT.
  Presses pressed() const {
    Presses presses;
    for (input_event pair[2]; read(uinput.get(), pair, sizeof pair) == sizeof pair;) {
      EXPECT_TRUE(pair[0].type == EV_KEY && pair[1].type == EV_SYN);
      presses.emplace_back(pair[0].code, pair[0].value);
    }
    return presses;
  }

  TemporaryDirectory directory;
  const std::string fifo = directory.path / "uinput";
  const base::FileDescriptor uinput{(mkfifo(fifo.c_str(), 0600), open(fifo.c_str(), O_RDONLY | O_NONBLOCK))};
};

TEST_F(PassThroughHelper, PressesItsKeysWhileTheUserIsInFrontAndNothingElse) {
  int ends[2];
  static_cast<void>(seteuid(65534));  // root would always be let in
  socketpair(AF_UNIX, SOCK_SEQPACKET, 0, ends);
  ASSERT_EQ(seteuid(getuid()), 0);
  sAnswers = 3;  // root, of whom nobody asks, did not make this connection
  const std::uint16_t malformed[] = {KEY_MUTE, 1, 0};
  for (const std::size_t size : {1, 2, 6}) send(ends[0], malformed, size, 0);
  for (const auto& press : Presses{
           {KEY_PLAY, 1}, {KEY_MUTE, 2}, {KEY_MUTE, 1}, {KEY_MUTE, 0}, {KEY_5, 1}, {KEY_6, 1}, {KEY_5, 0}}) {
    send(ends[0], &press, sizeof press, 0);
  }
  shutdown(ends[0], SHUT_WR);
  serve(ends[1]);
  EXPECT_THROW(serve(ends[1]), std::runtime_error) << "the user is no longer in front";
  EXPECT_EQ(pressed(), (Presses{{KEY_MUTE, 1}, {KEY_MUTE, 0}, {KEY_5, 1}, {KEY_5, 0}}));
  std::list<unsigned long> device{UI_SET_EVBIT, UI_DEV_SETUP, UI_DEV_CREATE};
  device.insert(std::next(device.begin()), pass_through::kKeys.begin(), pass_through::kKeys.end());
  EXPECT_EQ(sMade, device);
  EXPECT_EQ(read(uinput.get(), ends, 1), 0) << "somebody has the device open still";
}

TEST_F(PassThroughHelper, IsKnownToServeOrToRefuseAndIsStartedAnew) {
  sockaddr_un address{AF_UNIX, {}};
  const std::string path = directory.path / "socket";
  path.copy(address.sun_path, path.size());
  const base::FileDescriptor listener(socket(AF_UNIX, SOCK_SEQPACKET | SOCK_NONBLOCK, 0));
  ASSERT_EQ(bind(listener.get(), reinterpret_cast<const sockaddr*>(&address), sizeof address), 0);
  ASSERT_EQ(listen(listener.get(), 1), 0);
  PassThrough client(path);
  const auto accepted = [&] { return client.open() ? accept(listener.get(), nullptr, nullptr) : -1; };

  close(accepted());
  EXPECT_FALSE(client.press({1, KEY_MUTE}) || client.serves(std::chrono::seconds(10))) << "it refused";
  client.close();

  sAnswers = 100;
  const int first = accepted();
  shutdown(first, SHUT_RD);
  serve(first);
  EXPECT_TRUE(client.press({1, KEY_MUTE})) << "it served, and is started anew";
  EXPECT_TRUE(client.press({2, KEY_POWER}));
  client.releaseDevice(1);
  const int second = accepted();
  client.close();
  serve(second);
  EXPECT_EQ(pressed(), (Presses{{KEY_MUTE, 1}, {KEY_POWER, 1}, {KEY_MUTE, 0}}));
}

}  // namespace receiver
