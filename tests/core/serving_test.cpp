// The rehearsal desktop as a process of its own, with real messages from another one.

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <functional>
#include <string>
#include <vector>

#include "daemon/kvd.h"
#include "messages/kvd_messages.h"
#include "remote/kvd_client.h"

namespace {

/// A kvd-stage that was told to serve, with its transcript so far.
class Serving : public testing::Test {
 protected:
  /// Starts it with these commands; `prepare` runs in the new process before the program does.
  void start(
      const std::string& commands, const std::function<void()>& prepare = [] {}) {
    int input[2];
    int output[2];
    ASSERT_EQ(pipe(input), 0);
    ASSERT_EQ(pipe(output), 0);
    process_ = fork();
    if (process_ == 0) {
      dup2(input[0], STDIN_FILENO);
      dup2(output[1], STDOUT_FILENO);
      for (const int end : {input[0], input[1], output[0], output[1]}) close(end);
      prepare();
      execl(KVD_STAGE, KVD_STAGE, nullptr);
      _exit(127);
    }
    close(input[0]);
    close(output[1]);
    transcript_ = fdopen(output[0], "r");
    const std::string all = commands + "serve\nalive\n";
    ASSERT_EQ(write(input[1], all.data(), all.size()), static_cast<ssize_t>(all.size()));
    close(input[1]);
  }

  /// Waits until it serves and points the client at it.
  void findService() {
    constexpr std::string_view kAnnouncement = "  serving: XDG_RUNTIME_DIR=";
    for (std::string line; !(line = readLine()).empty();) {
      if (!line.starts_with(kAnnouncement)) continue;
      setenv("XDG_RUNTIME_DIR", line.substr(kAnnouncement.size()).c_str(), 1);
      break;
    }
    lookUp();
  }

  void lookUp() { ASSERT_EQ(kvd_look_up(&port_), KVD_SENT); }

  void sendButton(UsageKey key) {
    ASSERT_EQ(kvd_handlehidevent(port_, static_cast<std::uint16_t>(key >> 16),
                                 static_cast<std::uint16_t>(key), 0, 1),
              MACH_MSG_SUCCESS);
  }

  /// The rest of the transcript, and the exit status behind it.
  std::string finish() {
    std::string rest;
    for (std::string line; !(line = readLine()).empty();) rest += line + "\n";
    std::fclose(transcript_);
    int status = 0;
    waitpid(process_, &status, 0);
    return rest + "status " + std::to_string(status);
  }

  mach_port_t port_ = MACH_PORT_NULL;
  pid_t process_ = 0;

 private:
  std::string readLine() {
    std::string line;
    for (int c; (c = std::fgetc(transcript_)) != EOF && c != '\n';) line += static_cast<char>(c);
    return line;
  }

  std::FILE* transcript_ = nullptr;
};

constexpr const char* kEnd =
    "  notification com.tarn.kvd.terminated of com.tarn.kvd\n"
    "  timer of 10m stops\n"
    "  exit status 0\n"
    "alive\n"
    "  alive: serial number ×1, source ×1, port ×1\n"
    "  left alive: serial number ×1, source ×1, port ×1\n"
    "status 0";

TEST_F(Serving, LosesNothingInAFloodAndLeaksNothing) {
  constexpr int kButtons = 100'000;
  start("open lyrabox\nfront lyrabox\n");
  findService();
  for (int i = 0; i < kButtons; ++i) sendButton(Key::Play);
  ASSERT_EQ(kvd_terminate(port_), MACH_MSG_SUCCESS);
  EXPECT_EQ(finish(),
            "  ×50000:\n"
            "    asks who is in front: Lyrabox\n"
            "    script to Lyrabox: playpause\n"
            "    Lyrabox: plays \"Harbour Lights\"\n"
            "    asks who is in front: Lyrabox\n"
            "    script to Lyrabox: playpause\n"
            "    Lyrabox: paused in \"Harbour Lights\" at 0:00\n" +
                std::string(kEnd));
  EXPECT_EQ(kvd_terminate(port_), MACH_SEND_INVALID_DEST) << "nobody is behind the port any more";
}

TEST_F(Serving, PassesOverMalformedMessages) {
  start("open lyrabox\nfront lyrabox\n");
  findService();
  for (const std::uint32_t id : {0U, 599U, 600U, 601U, 602U, 603U, 0xFFFFFFFFU}) {
    for (const mach_msg_size_t size : {24U, 25U, 36U, 44U, 48U, 49U, 1000U}) {
      if (id == 600 && size == 24) continue;
      for (const mach_msg_bits_t complex : {0U, MACH_MSGH_BITS_COMPLEX}) {
        const bool valid = (id == 601 && size == 48) || (id == 602 && size == 36);
        if (valid && complex == 0) continue;
        std::vector<std::uint64_t> bytes(128, 0x0C0C0C0C0C0C0C0C);
        auto* const message = reinterpret_cast<mach_msg_header_t*>(bytes.data());
        *message = {MACH_MSG_TYPE_COPY_SEND | complex, 0, port_, 0, 0, static_cast<mach_msg_id_t>(id)};
        ASSERT_EQ(mach_msg(message, MACH_SEND_MSG, size, 0, MACH_PORT_NULL, 0, MACH_PORT_NULL),
                  MACH_MSG_SUCCESS);
      }
    }
  }
  sendButton(Key::Stop);
  ASSERT_EQ(kvd_terminate(port_), MACH_MSG_SUCCESS);
  EXPECT_EQ(finish(),
            "  asks who is in front: Lyrabox\n"
            "  script to Lyrabox: stop\n" +
                std::string(kEnd));
}

TEST_F(Serving, EndsInOrderOnSIGTERM) {
  start("open lyrabox\nfront lyrabox\n");
  findService();
  ASSERT_EQ(kill(process_, SIGTERM), 0);
  EXPECT_EQ(finish(),
            "  notification com.tarn.kvd.terminated of com.tarn.kvd\n  timer of 10m stops\n  exit status 0\n"
            "  left alive: serial number ×1, source ×1, port ×1\nstatus 0");
  EXPECT_FALSE(std::filesystem::exists(getenv("XDG_RUNTIME_DIR"))) << "its private directory is gone";
}

TEST_F(Serving, GoesNowhereWithoutADirectoryOfItsOwn) {
  start("quit\n", [] { setenv("TMPDIR", "/nonexistent", 1); });
  EXPECT_EQ(finish(), "quit\nstatus 256");
}

}  // namespace
