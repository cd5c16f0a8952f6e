#include "platform/stage/live.h"

#include <unistd.h>

#include <algorithm>
#include <ostream>
#include <string>

#include "platform/base/run_loop.h"
#include "platform/stage/commands.h"
#include "platform/stage/desktop.h"
#include "platform/stage/director.h"
#include "platform/stage/fold.h"
#include "platform/stage/line_reader.h"

namespace stage {

namespace {

/// Behind everything that the daemon waits for.
constexpr std::int32_t kInputOrder = 1;

void wait(const LiveView& view, std::optional<Nanoseconds> deadline) {
  view.idle();
  for (const std::optional<Nanoseconds> other : {nextDesktopChange(), waitEnd(), view.wakeUp()}) {
    if (other && (!deadline || *other < *deadline)) deadline = other;
  }
  base::waitForSources(deadline);
  advanceDesktop();
  if (waitEnd() && *waitEnd() <= now()) finishWait();
}

}  // namespace

int playLive(const LiveView& view) {
  beginRehearsal({now, [&view](std::optional<Nanoseconds> deadline) { wait(view, deadline); }, pass},
                 view.show);
  const HostSourceRef input(new base::Source(STDIN_FILENO, kInputOrder, view.input));
  HostRunLoopAddSource(HostRunLoopCurrent(), input, HostRunLoopMode::Default);
  const int status = runDaemon();
  HostRunLoopRemoveSource(HostRunLoopCurrent(), input, HostRunLoopMode::Default);
  HostRelease(input);
  view.idle();
  setJournalListener(nullptr);
  return status;
}

int playConsole(std::ostream& output) {
  LineReader reader(STDIN_FILENO);
  Fold lines;
  output << "The rehearsal desktop. Try: open spindle, then: tap play. help lists the commands, quit ends."
         << std::endl;
  return playLive({
      [&](const JournalLine& line) { lines.add(line.text, 0); },
      [&] {
        constexpr int kNothingElse = -1;
        if (const auto line = reader.next(kNothingElse)) {
          performCommand(*line);
        } else {
          terminateDaemon();
        }
      },
      [&] {
        lines.write(output);
        output.flush();
      },
      [] { return std::nullopt; },
  });
}

}  // namespace stage
