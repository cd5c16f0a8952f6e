// From the bottom up: lines, time, commands, the play.
//
// The daemon's run loop waits when nothing is ready and nothing is due. Here that is the moment at which time
// moves, or else the next command is read: never in the middle of anything.

#include "platform/stage/transcript.h"

#include <stdlib.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <filesystem>
#include <optional>
#include <ostream>
#include <stdexcept>
#include <string>
#include <utility>

#include "platform/stage/commands.h"
#include "platform/stage/desktop.h"
#include "platform/stage/director.h"
#include "platform/stage/fold.h"
#include "platform/stage/line_reader.h"
#include "platform/stage/report.h"

namespace stage {

namespace {

std::ostream* sOutput = nullptr;
LineReader* sReader = nullptr;

/// What came of the command in progress, and when it began.
Fold sLines;
Nanoseconds sCommandStart = 0;

/// A command that was read but needs the daemon, which does not run yet.
std::optional<std::string> sPending;
bool sDaemonStarted = false;
/// The daemon could not start, or a command was unknown or wrong.
bool sFailed = false;
bool sInputEnded = false;
bool sServing = false;

void addLine(const JournalLine& line) {
  sLines.add(line.text, std::max<Nanoseconds>(0, line.time - sCommandStart));
}

void writeLines() {
  sLines.write(*sOutput);
  sOutput->flush();
}

void perform(const std::string& line) {
  sCommandStart = now();
  if (!performCommand(line)) sFailed = true;
}

/// Reads the next command and performs it, or keeps it pending where the daemon must run first. False at the
/// end of the input, or when the run loop has something to do before a command came.
bool performNextCommand(int loopDescriptor) {
  while (const std::optional<std::string> line = sReader->next(loopDescriptor)) {
    if (!line->empty() && (line->front() == ' ' || line->front() == '\t')) continue;
    writeLines();
    *sOutput << *line << std::endl;
    if (!sDaemonStarted && needsDaemon(*line)) {
      sPending = *line;
    } else {
      perform(*line);
    }
    return true;
  }
  return false;
}

/// Without the daemon there is no run loop to look after.
constexpr int kNoLoop = -1;

void performRest() {
  do {
    while (waitEnd()) letTimePass(std::nullopt);
  } while (!sInputEnded && !sPending && !base::endedBySignal() && performNextCommand(kNoLoop));
}

void endInput() {
  sInputEnded = true;
  sCommandStart = now();
  say("end of input");
  terminateDaemon();
}

void wait(std::optional<Nanoseconds> deadline) {
  if (sPending) {
    perform(*std::exchange(sPending, std::nullopt));
  } else if (waitEnd()) {
    letTimePass(deadline);
  } else if (sServing || sInputEnded) {
    base::waitForSources(std::nullopt);
  } else if (!performNextCommand(base::runLoopDescriptor()) && sReader->atEnd()) {
    endInput();
  }
}

/// A directory of its own for the service socket, so that rehearsals meet neither each other nor a kvd at
/// work; empty when the service manager passed a socket.
std::string makePrivateDirectory() {
  const char* const passedTo = getenv("LISTEN_PID");
  if (passedTo != nullptr && passedTo == std::to_string(getpid())) return {};
  const char* const given = getenv("TMPDIR");
  std::string path = std::string(given != nullptr && *given != '\0' ? given : "/tmp") + "/kvd-stage-XXXXXX";
  if (mkdtemp(path.data()) == nullptr) {
    throw std::runtime_error("cannot make the directory " + path + ": " + std::strerror(errno) +
                             "; set TMPDIR to one that takes it");
  }
  setenv("XDG_RUNTIME_DIR", path.c_str(), 1);
  return path;
}

void playWithDaemon() {
  sDaemonStarted = true;
  const std::string directory = makePrivateDirectory();
  sCommandStart = now();
  if (runDaemon() != 0) sFailed = true;
  sServing = false;
  std::error_code ignored;
  if (!directory.empty()) std::filesystem::remove_all(directory, ignored);
  // A command that asked for the daemon learns that it is not there.
  if (sPending) perform(*std::exchange(sPending, std::nullopt));
  performRest();
  sCommandStart = now();
  say("left alive: " + aliveText());
}

}  // namespace

int playTranscript(int input, std::ostream& output) {
  useVirtualTime();
  beginRehearsal({now, wait, pass}, addLine);
  LineReader reader(input);
  sReader = &reader;
  sOutput = &output;
  performRest();
  if (sPending) playWithDaemon();
  writeLines();
  setJournalListener(nullptr);
  return sFailed ? 1 : 0;
}

void serve() {
  if (sReader == nullptr) return say("other processes are answered anyway");
  sServing = true;
  writeLines();
  const char* const directory = getenv("XDG_RUNTIME_DIR");
  *sOutput << "  serving: XDG_RUNTIME_DIR=" << (directory != nullptr ? directory : "") << std::endl;
}

}  // namespace stage
