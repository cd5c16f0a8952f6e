// From the bottom up: the transcript's lines, time, reading commands, the daemon's run, the two ways to play.
//
// The daemon's run loop calls wait() when nothing is ready and nothing is due. In a transcript that is the
// moment at which time moves, or else the next command is read: never in the middle of anything.

#include "platform/stage/director.h"

#include <poll.h>
#include <stdlib.h>
#include <unistd.h>

#include <algorithm>
#include <filesystem>
#include <iostream>
#include <optional>
#include <utility>

#include "daemon/lifecycle.h"
#include "platform/base/run_loop.h"
#include "platform/stage/commands.h"
#include "platform/stage/desktop.h"
#include "platform/stage/fold.h"
#include "platform/stage/journal.h"
#include "platform/stage/line_reader.h"
#include "platform/stage/report.h"

namespace stage {

namespace {

enum class Daemon { NotStarted, Running, Ended };

std::ostream* sOutput = nullptr;
Fold sLines;
Nanoseconds sCommandStart = 0;

LineReader* sReader = nullptr;
/// A command that was read but needs the daemon, which does not run yet.
std::optional<std::string> sPending;
bool sCommandFailed = false;
bool sInputEnded = false;
bool sServing = false;
Daemon sDaemon = Daemon::NotStarted;

/// While a command lets time pass: until when, and what it does then.
std::optional<Nanoseconds> sWaitUntil;
std::function<void()> sThen;

// ---- The transcript's lines ----

void writeLines() {
  sLines.write(*sOutput);
  sOutput->flush();
}

/// In real time only the order tells anything.
void addLine(const std::string& text, Nanoseconds time) {
  if (!timeIsVirtual()) return sLines.add(text, 0);

  sLines.add(text, std::max<Nanoseconds>(0, time - sCommandStart));
}

// ---- Time ----

void finishWait() {
  sWaitUntil.reset();
  if (const auto then = std::exchange(sThen, nullptr)) then();
}

/// Moves virtual time to the next thing that happens, or to the end of the wait.
void moveTime(std::optional<Nanoseconds> deadline) {
  const std::optional<Nanoseconds> change = nextDesktopChange();
  Nanoseconds next = *sWaitUntil;
  if (deadline) next = std::min(next, *deadline);
  if (change) next = std::min(next, *change);
  advanceTo(next);
  advanceDesktop();
  const bool timerIsDue = deadline && *deadline <= next;
  if (next == *sWaitUntil && !timerIsDue) finishWait();
}

// ---- Commands ----

void perform(const std::string& line) {
  sCommandStart = now();
  const std::optional<std::string> error = runCommand(line);
  if (!error) return;
  sCommandFailed = true;
  say("error: " + *error);
}

/// Reads the next command and performs it, or keeps it pending where the daemon must run first. False at the
/// end of the input, or when the run loop has something to do before a command came.
bool performNextCommand(bool daemonRuns) {
  while (const std::optional<std::string> line = sReader->next(daemonRuns ? base::runLoopDescriptor() : -1)) {
    if (!line->empty() && (line->front() == ' ' || line->front() == '\t')) continue;
    writeLines();
    *sOutput << *line << std::endl;
    if (sDaemon == Daemon::NotStarted && needsDaemon(*line)) {
      sPending = *line;
    } else {
      perform(*line);
    }
    return true;
  }
  return false;
}

void endInput() {
  sInputEnded = true;
  sCommandStart = now();
  say("end of input");
  terminateDaemon();
}

void waitInTranscript(std::optional<Nanoseconds> deadline) {
  if (sPending) {
    perform(*std::exchange(sPending, std::nullopt));
  } else if (sWaitUntil) {
    moveTime(deadline);
  } else if (sServing || sInputEnded) {
    base::waitForSources(std::nullopt);
  } else if (!performNextCommand(true) && sReader->atEnd()) {
    endInput();
  }
}

void waitLive(std::optional<Nanoseconds> deadline) {
  writeLines();
  std::optional<Nanoseconds> next = nextDesktopChange();
  if (deadline && (!next || *deadline < *next)) next = deadline;
  if (sWaitUntil && (!next || *sWaitUntil < *next)) next = sWaitUntil;
  base::waitForSources(next);
  advanceDesktop();
  if (sWaitUntil && *sWaitUntil <= now()) finishWait();
}

// ---- The daemon ----

void runDaemon() {
  sDaemon = Daemon::Running;
  base::endLoopOnSignals();
  sCommandStart = now();
  const int status = KVDMain();
  sDaemon = Daemon::Ended;
  sServing = false;
  record(Entry::Exit, "exit status " + std::to_string(status));
}

/// A directory of its own for the service socket, so that rehearsals do not meet; empty when the service
/// manager passed a socket.
std::string makePrivateDirectory() {
  if (getenv("LISTEN_FDS") != nullptr) return {};
  std::string path = std::filesystem::temp_directory_path() / "kvd-stage-XXXXXX";
  if (mkdtemp(path.data()) == nullptr) return {};
  setenv("XDG_RUNTIME_DIR", path.c_str(), 1);
  return path;
}

void begin(std::ostream& output, base::TimeSource time) {
  sOutput = &output;
  base::setTimeSource(std::move(time));
  base::setTimerObserver([](const base::Timer& timer, bool started) {
    record(Entry::Timer, "timer of " + timeText(timer.period) + (started ? " starts" : " stops"));
  });
  setJournalListener([](const JournalLine& line) { addLine(line.text, line.time); });
}

}  // namespace

void waitThen(Nanoseconds duration, std::function<void()> then) {
  if (sWaitUntil) finishWait();
  sWaitUntil = now() + duration;
  sThen = std::move(then);
}

void serve() {
  sServing = true;
  writeLines();
  const char* const directory = getenv("XDG_RUNTIME_DIR");
  *sOutput << "  serving: XDG_RUNTIME_DIR=" << (directory != nullptr ? directory : "") << std::endl;
}

bool daemonHasEnded() { return sDaemon == Daemon::Ended; }

void say(const std::string& text) { addLine(text, now()); }

int playTranscript(int input, std::ostream& output) {
  useVirtualTime();
  begin(output, {now, waitInTranscript, pass});
  LineReader reader(input);
  sReader = &reader;

  while (!sPending && performNextCommand(false)) {
    while (sWaitUntil) moveTime(std::nullopt);
  }
  if (sPending) {
    const std::string directory = makePrivateDirectory();
    runDaemon();
    std::error_code ignored;
    if (!directory.empty()) std::filesystem::remove_all(directory, ignored);
    // A command that asked for the daemon learns that it is not there.
    if (sPending) perform(*std::exchange(sPending, std::nullopt));
    do {
      while (sWaitUntil) moveTime(std::nullopt);
    } while (!sInputEnded && !base::endedBySignal() && performNextCommand(false));
    addLine("left alive: " + aliveText(), sCommandStart);
  }
  writeLines();
  setJournalListener(nullptr);
  return sCommandFailed ? 1 : 0;
}

int playLive(std::ostream& output) {
  begin(output, {now, waitLive, pass});
  LineReader reader(STDIN_FILENO);
  sReader = &reader;
  auto* const terminal = new base::Source(STDIN_FILENO, 1, [] {
    if (const std::optional<std::string> line = sReader->next(-1)) {
      perform(*line);
    } else {
      endInput();
    }
  });
  const HostSourceRef source(terminal);
  HostRunLoopAddSource(HostRunLoopCurrent(), source, HostRunLoopMode::Default);
  output << "The rehearsal desktop. Try: open lyrabox, then: tap play. help lists the commands, quit ends."
         << std::endl;
  runDaemon();
  HostRunLoopRemoveSource(HostRunLoopCurrent(), source, HostRunLoopMode::Default);
  HostRelease(source);
  writeLines();
  setJournalListener(nullptr);
  return 0;
}

}  // namespace stage
