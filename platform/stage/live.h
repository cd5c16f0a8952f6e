// A rehearsal at a terminal, in real time.
#pragma once

#include <functional>
#include <iosfwd>
#include <optional>
#include <string>

#include "platform/stage/clock.h"
#include "platform/stage/journal.h"

namespace stage {

/// Where a live rehearsal is seen and steered; the desktop knows nothing of it.
struct LiveView {
  std::function<void(const JournalLine& line)> show;
  /// Standard input has something to read.
  std::function<void()> input;
  /// Between any two things that the daemon is given to do.
  std::function<void()> between;
  /// Everything that was to be done is done: the moment to draw.
  std::function<void()> idle;
  /// The daemon sleeps, or waits for an application; asked several times a second. What has come of it so far
  /// can be drawn. False when it shall not sleep on, because the run is to end.
  std::function<bool()> asleep;
  /// When it wants to draw again although nothing happens.
  std::function<std::optional<Nanoseconds>()> wakeUp;
};

/// Runs the daemon until it ends. Returns its exit status.
int playLive(const LiveView& view);

/// Writes what was done so far into a new file, as a transcript that is its own test. Throws
/// remote::UsageError where that cannot be.
void saveRehearsal(const std::string& path);

/// Takes commands a line at a time and prints the journal: for a terminal without a screen.
int playConsole(std::ostream& output);

}  // namespace stage
