#include "platform/stage/live.h"

#include <fcntl.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <ostream>
#include <string>

#include "platform/base/file_descriptor.h"
#include "platform/base/run_loop.h"
#include "platform/stage/commands.h"
#include "platform/stage/desktop.h"
#include "platform/stage/director.h"
#include "platform/stage/fold.h"
#include "platform/stage/line_reader.h"
#include "platform/stage/recording.h"
#include "platform/stage/replay.h"
#include "platform/stage/visitors.h"
#include "remote/words.h"

namespace stage {

namespace {

/// Behind everything that the daemon waits for.
constexpr std::int32_t kInputOrder = 1;

/// When the rehearsal began; nothing before.
std::optional<Nanoseconds> sBegin;
Recording sRecording;

Moment moment() { return {now() - *sBegin - slept().taken, slept().asked}; }

void wait(const LiveView& view, std::optional<Nanoseconds> deadline) {
  view.idle();
  for (const std::optional<Nanoseconds> other : {nextDesktopChange(), waitEnd(), view.wakeUp()}) {
    deadline = earlier(deadline, other);
  }
  base::waitForSources(deadline);
  advanceDesktop();
  if (waitEnd() && *waitEnd() <= now()) finishWait();
}

}  // namespace

int playLive(const LiveView& view) {
  sBegin = now();
  beginRehearsal({now, [&view](std::optional<Nanoseconds> deadline) { wait(view, deadline); }, pass},
                 view.show);
  setSleepListener(view.asleep);
  setKeeper([](const std::string& command) { sRecording.add(command, moment()); });
  watchVisitors();
  auto* const keyboard = new base::Source(STDIN_FILENO, kInputOrder, view.input);
  // The loop asks before each thing that it does.
  keyboard->prepare = [&view] {
    view.between();
    return false;
  };
  const HostSourceRef input(keyboard);
  HostRunLoopAddSource(HostRunLoopCurrent(), input, HostRunLoopMode::Default);
  const int status = runDaemon();
  HostRunLoopRemoveSource(HostRunLoopCurrent(), input, HostRunLoopMode::Default);
  HostRelease(input);
  view.idle();
  ignoreVisitors();
  setKeeper(nullptr);
  setSleepListener(nullptr);
  setJournalListener(nullptr);
  return status;
}

void saveRehearsal(const std::string& path) {
  if (!sBegin) throw remote::UsageError("only a rehearsal at a terminal can be saved");
  const std::string commands = sRecording.commands(moment());
  const base::FileDescriptor file(open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666));
  if (!file) throw remote::UsageError("cannot save to " + path + ": " + std::strerror(errno));
  const std::optional<std::string> transcript = playAgain(commands);
  if (!transcript || !base::writeAll(file, *transcript)) {
    const int error = errno;
    unlink(path.c_str());
    throw remote::UsageError("cannot save to " + path + ": " +
                             (transcript ? std::strerror(error) : "it could not be played to its end"));
  }
  say("saved to " + path);
}

int playConsole(std::ostream& output) {
  LineReader reader(STDIN_FILENO);
  Fold lines;
  output << "The rehearsal desktop. Try: open spindle, then: tap play. help lists the commands, quit ends."
         << std::endl;
  const auto print = [&] {
    lines.write(output);
    output.flush();
  };
  return playLive({
      .show = [&](const JournalLine& line) { lines.add(line.text, 0); },
      .input =
          [&] {
            constexpr int kNothingElse = -1;
            if (const auto line = reader.next(kNothingElse)) {
              performCommand(*line);
            } else {
              terminateDaemon();
            }
          },
      .between = [] {},
      .idle = print,
      .asleep =
          [&] {
            print();
            return true;
          },
      .wakeUp = [] { return std::nullopt; },
  });
}

}  // namespace stage
