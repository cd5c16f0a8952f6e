// kvremote from its words to the messages it sends.
#include <gtest/gtest.h>

#include <chrono>
#include <csignal>
#include <iterator>
#include <sstream>
#include <tuple>

#include "messages/kvd_messages.h"
#include "platform/base/failure.h"
#include "remote/arguments.h"
#include "remote/buttons.h"
#include "remote/deliver.h"
#include "remote/session.h"
#include "tests/remote/fake_mach.h"

namespace {

using Names = std::vector<std::string>;

remote::Arguments parse(const std::string& line) {
  std::istringstream stream(line);
  const Names words{std::istream_iterator<std::string>(stream), {}};
  std::vector<const char*> pointers;
  for (const std::string& word : words) pointers.push_back(word.c_str());
  return remote::parseArguments(pointers);
}

kvd_handlehidevent_request_t messageOf(const SentMessage& sent) {
  kvd_handlehidevent_request_t message = {};
  std::copy(sent.bytes.begin(), sent.bytes.end(), reinterpret_cast<std::uint8_t*>(&message));
  return message;
}

// What a command line sends: id, page, usage, extra and the values of all its messages.
std::vector<std::int64_t> sentBy(const std::string& line) {
  gSent.clear();
  EXPECT_EQ(remote::deliver(parse(line)), 0);
  const auto first = messageOf(gSent.at(0));
  std::vector<std::int64_t> result = {first.Head.msgh_id, first.usagePage, first.usage, first.extra};
  for (const SentMessage& sent : gSent) result.push_back(messageOf(sent).value);
  return result;
}

TEST(Command, SendsWhatItsWordsAskFor) {
  const std::pair<const char*, std::vector<std::int64_t>> cases[] = {
      {"play", {601, 0x0C, 0xB0, 0, 1}},
      {"Play/Pause", {601, 0x0C, 0xCD, 0, 1}},
      {"system-app-menu", {601, 0x01, 0x86, 0, 1}},
      {"scan-next-track --press", {601, 0x0C, 0xB5, 0, 1}},
      {"--release menu-left", {601, 0x0C, 0x44, 0, 0}},
      {"rewind", {601, 0x0C, 0xB4, 0, 1, 0}},
      {"pause --hold 1ms", {601, 0x0C, 0xB1, 0, 1, 0}},
      {"--raw 0xFFFF 65535 -0x80000000", {601, 0xFFFF, 0xFFFF, 0, INT32_MIN}},
      {"1 2 --raw 2147483647 0XaB", {601, 1, 2, 0xAB, INT32_MAX}},
      {"lock on", {602, 1, 0, 0, 0}},
      {"lock off", {602, 0, 0, 0, 0}},
      {"quit", {600, 0, 0, 0, 0}},
  };
  for (const auto& [line, messages] : cases) EXPECT_EQ(sentBy(line), messages) << line;
}

TEST(Command, ReadsTimes) {
  const std::pair<const char*, int> cases[] = {{"2s", 2000},  {"500ms", 500}, {"1.5s", 1500},
                                               {"1m", 60000}, {"3", 3000},    {"10m", 600000}};
  for (const auto& [text, milliseconds] : cases) {
    EXPECT_EQ(parse(std::string("up --hold ") + text).hold.count(), milliseconds) << text;
  }
}

TEST(Command, TellsHowLongAButtonCanBeHeld) {
  for (const std::string time : {"0", "601s", "2h10m", "9999h", "nan", "1e2s", "2d"}) {
    try {
      parse("play --hold=" + time);
      ADD_FAILURE() << time;
    } catch (const remote::UsageError& error) {
      EXPECT_EQ(error.what(), "a button can be held for 1ms to 10m (500ms, 1.5s, 1m30s), not '" + time + "'");
    }
  }
}

TEST(Command, RefusesBadLines) {
  std::istringstream lines(
      ";play menu;play --press --release;play --loud;unplay;play --hold;play --user;"
      "lock maybe;quit now;list --press;--raw 1 2;--raw 0x10000 2 1;"
      "--raw 1 -1 1;--raw 1 2 2147483648;--raw 1 2 --3;--raw 1 2 1x;--raw 1 2 99999999999999999999");
  for (std::string line; std::getline(lines, line, ';');) {
    EXPECT_THROW(parse(line), remote::UsageError) << line;
  }
}

TEST(Buttons, SuggestNearestNames) {
  const std::pair<const char*, Names> cases[] = {{"plya", {"play"}},
                                                 {"vol", {"volume-up", "volume-down"}},
                                                 {"scan-nxt-track", {"scan-next-track"}},
                                                 {"eject", {}},
                                                 {"record", {}}};
  for (const auto& [name, nearest] : cases) EXPECT_EQ(remote::nearestButtonNames(name), nearest) << name;
}

TEST(Command, GoesToTheSessionThatIsNamed) {
  setenv("XDG_RUNTIME_DIR", "/own", 1);
  remote::chooseSession(parse("play").user);
  EXPECT_STREQ(getenv("XDG_RUNTIME_DIR"), "/own");
  remote::chooseSession(parse("play --user root").user);
  EXPECT_STREQ(getenv("XDG_RUNTIME_DIR"), "/run/user/0");
  EXPECT_THROW(remote::chooseSession("no such user"), remote::UsageError);
}

TEST(Buttons, OnlyHeldOnesReleaseOnATap) {
  Names held;
  for (const remote::Button& button : remote::buttons()) {
    if (remote::tapValues(button).size() > 1) held.emplace_back(button.hidName);
  }
  EXPECT_EQ(held, (Names{"Fast Forward", "Rewind", "Volume Increment", "Volume Decrement", "System Menu Up",
                         "System Menu Down"}));
}

TEST(Delivery, TellsWhyNothingWasSent) {
  const std::tuple<kern_return_t, mach_msg_return_t, int, const char*> cases[] = {
      {BOOTSTRAP_UNKNOWN_SERVICE, 0, 1, "kvremote: nobody is there\n"},
      {0, MACH_SEND_INVALID_DEST, 1, "kvremote: com.tarn.kvd has ended meanwhile\n"},
      {0, MACH_SEND_TIMED_OUT, 3, "kvremote: the queue of com.tarn.kvd stayed full for 5 seconds\n"},
      {KERN_FAILURE, 0, 1, "kvremote: cannot send to com.tarn.kvd (error 0x5)\n"},
  };
  base::noteFailure("nobody is there");
  for (const auto& [lookUp, send, status, line] : cases) {
    gLookUpResult = lookUp;
    gSendResult = [result = send] { return result; };
    gSent.clear();
    testing::internal::CaptureStderr();
    EXPECT_EQ(remote::deliver(parse("rewind")), status);
    EXPECT_EQ(testing::internal::GetCapturedStderr(), line);
    EXPECT_EQ(gSent.size(), lookUp == KERN_SUCCESS ? 1U : 0U) << "a press that failed has no release";
  }
}

TEST(Delivery, ReleasesAHeldButtonBeforeDyingOfASignal) {
  gLookUpResult = KERN_SUCCESS;
  for (const int signal : {SIGHUP, SIGINT, SIGTERM}) {
    gSendResult = [signal] {
      std::fprintf(stderr, "sent %d\n", messageOf(gSent.back()).value);
      if (gSent.size() == 1) raise(signal);
      return MACH_MSG_SUCCESS;
    };
    gSent.clear();
    EXPECT_EXIT(remote::deliver(parse("up --hold 10m")), testing::KilledBySignal(signal), "sent 1\nsent 0\n");
    std::signal(signal, SIG_IGN);
    const auto start = std::chrono::steady_clock::now();
    EXPECT_EQ(sentBy("up --hold 20ms").size(), 6U);
    EXPECT_GE(std::chrono::steady_clock::now() - start, std::chrono::milliseconds(20))
        << "an ignored signal changes nothing";
  }
}

}  // namespace
