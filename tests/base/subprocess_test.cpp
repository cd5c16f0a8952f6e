#include "platform/base/subprocess.h"

#include <gtest/gtest.h>
#include <sys/wait.h>

#include <cerrno>
#include <csignal>

#include "platform/base/signal_set.h"

namespace {

using namespace std::chrono_literals;

/// No run is to take so long.
constexpr auto kAges = 10min;
constexpr std::size_t kMost = 200'000;

std::optional<base::SubprocessResult> runShell(const std::string& script, std::chrono::nanoseconds limit,
                                               const std::string& input = {}, bool discardsErrors = false) {
  return base::runToEnd({"/bin/sh", {"sh", "-c", script}, input, discardsErrors}, kMost,
                        base::Deadline(limit));
}

TEST(Subprocess, WhatItSaysAndHowItEndsComeBack) {
  const std::string large(kMost, 'x');
  const struct {
    std::string script, input;
    int status;
    std::string output;
  } cases[] = {
      {"echo said; exit 3", "", 3, "said\n"},
      {"cat", "given\n", 0, "given\n"},
      {"cat; echo end", "", 0, "end\n"},
      {"cat", large, 0, large},
      {"printf '%s' \"$0\" \"$#\"; exec >&-; exit 255", "", 255, "sh0"},
  };
  for (const auto& c : cases) {
    const auto result = runShell(c.script, kAges, c.input);
    ASSERT_TRUE(result) << c.script;
    EXPECT_EQ(result->status, c.status) << c.script;
    EXPECT_EQ(result->output, c.output) << c.script;
  }
}

TEST(Subprocess, WhatDoesNotEndByItselfHasNoStatus) {
  EXPECT_FALSE(base::runToEnd({.path = "/nonexistent"}, kMost, base::Deadline(kAges)));
  const auto killed = runShell("echo said; kill -KILL $$", kAges);
  EXPECT_FALSE(killed->status);
  EXPECT_EQ(killed->output, "said\n");
  EXPECT_FALSE(runShell("cat; echo", kAges, std::string(kMost, 'x'))->status) << "a byte too many";
  EXPECT_FALSE(runShell("while :; do echo more; done", kAges)->status);
  EXPECT_FALSE(runShell("echo said; exec sleep 1000", 20ms)->status);
  EXPECT_FALSE(runShell("exec >&-; exec sleep 1000", 20ms)->status) << "it ended its output, not itself";
  EXPECT_EQ(waitpid(-1, nullptr, WNOHANG), -1) << "a child was left";
  EXPECT_EQ(errno, ECHILD);
}

TEST(Subprocess, TheRunLoopsSignalsAreNotInherited) {
  const sigset_t ending = base::signalSet({SIGTERM});
  sigset_t before;
  sigprocmask(SIG_BLOCK, &ending, &before);
  const auto previous = std::signal(SIGPIPE, SIG_IGN);
  for (const std::string signal : {"TERM", "PIPE"}) {
    EXPECT_FALSE(runShell("kill -" + signal + " $$; echo alive", kAges)->status) << signal;
  }
  std::signal(SIGPIPE, previous);
  sigprocmask(SIG_SETMASK, &before, nullptr);
}

TEST(Subprocess, ErrorsAreInheritedOrDiscarded) {
  testing::internal::CaptureStderr();
  runShell("echo trouble >&2", kAges);
  runShell("echo hidden >&2", kAges, {}, true);
  EXPECT_EQ(testing::internal::GetCapturedStderr(), "trouble\n");
}

}  // namespace
