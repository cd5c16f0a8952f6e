#include "simulator/rehearsal.h"

#include <stdlib.h>
#include <sys/mman.h>
#include <sys/time.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <filesystem>
#include <stdexcept>
#include <string_view>
#include <system_error>

#include "platform/base/run_loop.h"
#include "platform/stage/desktop.h"
#include "platform/stage/director.h"
#include "simulator/promises.h"

namespace simulator {

namespace {

/// A daemon that works for so many seconds of the processor's time hangs.
constexpr time_t kPatience = 60;

constexpr int kBroken = 3;

/// What the processes of a rehearsal have in common. One of them works at a time, and the others wait for it.
struct Shared {
  std::uint64_t commandCount;
  char what[1024];
  char word[128];
  /// The commands up to now, each ended by a line break.
  std::size_t length;
  char commands[1 << 18];
};

Shared& shared() {
  static Shared* const area = [] {
    void* const made =
        mmap(nullptr, sizeof(Shared), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
    if (made == MAP_FAILED) throw std::runtime_error("no memory to share");
    return static_cast<Shared*>(made);
  }();
  return *area;
}

/// This process's part of the commands; a copy begins with its parent's.
std::size_t sLength = 0;

void note(const std::string& command) {
  ++shared().commandCount;
  const std::size_t room = sizeof shared().commands - sLength;
  const std::size_t size = std::min(command.size() + 1, room);
  std::memcpy(shared().commands + sLength, (command + "\n").data(), size);
  shared().length = sLength += size;
}

[[noreturn]] void fail(const std::string& what) {
  shared().what[what.copy(shared().what, sizeof shared().what - 1)] = '\0';
  _exit(kBroken);
}

[[noreturn]] void end() {
  if (const auto promise = brokenPromise()) fail(*promise);
  _exit(0);
}

/// Has a signal end this process when the time is over; a copy begins without that.
void limitTime() {
  const itimerval limit{.it_interval = {}, .it_value = {.tv_sec = kPatience, .tv_usec = 0}};
  setitimer(ITIMER_PROF, &limit, nullptr);
}

/// How a process ended, where that was not well.
std::optional<std::string> misfortune(int process) {
  int status = 0;
  while (waitpid(process, &status, 0) < 0) {
    if (errno != EINTR) return "it is lost";
  }
  if (status == 0) return std::nullopt;
  if (WIFEXITED(status) && WEXITSTATUS(status) == kBroken) return shared().what;
  if (WIFSIGNALED(status) && WTERMSIG(status) == SIGPROF) return "the daemon hangs";
  return WIFSIGNALED(status) ? std::string("the daemon dies: ") + strsignal(WTERMSIG(status))
                             : "the process ends with status " + std::to_string(WEXITSTATUS(status));
}

[[noreturn]] void play(const Rehearsal& rehearsal) {
  limitTime();
  const auto wait = [&](std::optional<base::Nanoseconds> deadline) {
    // Before time passes too: a scan that ends by itself may play on a while after a button.
    checkAtRest();
    if (brokenPromise()) end();
    if (stage::waitEnd()) return stage::letTimePass(deadline);
    const std::optional<std::string> command = rehearsal.commands();
    if (!command) end();
    note(*command);
    if (!stage::performCommand(*command) && rehearsal.endsAtRefusal) end();
  };
  stage::useVirtualTime();
  stage::setUpDesktop();
  stage::beginRehearsal({stage::now, wait, stage::pass}, watchJournal);
  watchMessages();
  if (rehearsal.prepare) rehearsal.prepare();
  checkAtEnd(stage::runDaemon());
  end();
}

}  // namespace

std::optional<Failure> rehearse(const Rehearsal& rehearsal) {
  shared().length = 0;
  leaveWord("");
  const pid_t process = fork();
  if (process == 0) play(rehearsal);
  if (process < 0) throw std::runtime_error("no process for a rehearsal");
  auto what = misfortune(process);
  if (!what) return std::nullopt;
  Failure failure{*std::move(what), {}};
  std::string_view rest(shared().commands, shared().length);
  for (std::size_t end; (end = rest.find('\n')) != std::string_view::npos; rest.remove_prefix(end + 1)) {
    failure.commands.emplace_back(rest.substr(0, end));
  }
  return failure;
}

std::optional<Failure> rehearse(const std::vector<std::string>& commands) {
  std::size_t next = 0;
  return rehearse({.commands = [&]() -> std::optional<std::string> {
    if (next == commands.size()) return std::nullopt;
    return commands[next++];
  }});
}

void leaveWord(const std::string& word) {
  shared().word[word.copy(shared().word, sizeof shared().word - 1)] = '\0';
}

std::string wordLeft() { return shared().word; }

bool inCopy() {
  const pid_t copy = fork();
  if (copy == 0) {
    limitTime();
    return true;
  }
  if (copy < 0) fail("no process for a copy");
  if (const auto what = misfortune(copy)) fail(*what);
  return false;
}

std::uint64_t played() { return shared().commandCount; }

RuntimeDirectory::RuntimeDirectory()
    : path_(std::filesystem::temp_directory_path() / "kvd-simulator-XXXXXX") {
  if (mkdtemp(path_.data()) == nullptr) {
    throw std::runtime_error("cannot make the directory " + path_ + ": " + std::strerror(errno));
  }
  setenv("XDG_RUNTIME_DIR", path_.c_str(), 1);
}

RuntimeDirectory::~RuntimeDirectory() {
  std::error_code ignored;
  std::filesystem::remove_all(path_, ignored);
}

}  // namespace simulator
