// A rehearsal at a terminal, in real time.
#pragma once

#include <functional>
#include <iosfwd>
#include <optional>

#include "platform/stage/clock.h"
#include "platform/stage/journal.h"

namespace stage {

/// Where a live rehearsal is seen and steered; the desktop knows nothing of it.
struct LiveView {
  std::function<void(const JournalLine& line)> show;
  /// Standard input has something to read.
  std::function<void()> input;
  /// Everything that was to be done is done: the moment to draw.
  std::function<void()> idle;
  /// When it wants to draw again although nothing happens.
  std::function<std::optional<Nanoseconds>()> wakeUp;
};

/// Runs the daemon until it ends. Returns its exit status.
int playLive(const LiveView& view);

/// Takes commands a line at a time and prints the journal: for a terminal without a screen.
int playConsole(std::ostream& output);

}  // namespace stage
