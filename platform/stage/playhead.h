// Where something that plays is: a position that moves with the clock at some rate.
#pragma once

#include <optional>

#include "platform/stage/clock.h"

namespace stage {

class Playhead {
 public:
  /// The position now, from the beginning of what plays.
  Nanoseconds position() const;
  /// How much of it passes in the time that passes: 1 plays, 0 stands still, negative goes back.
  double rate() const { return rate_; }

  /// Changes the rate from `when` on.
  void setRate(double rate, Nanoseconds when = now());
  /// Jumps to a position at `when`.
  void seek(Nanoseconds position, Nanoseconds when = now());

  /// When it arrives at the end that it moves to: `length` going forward, the beginning going back; nothing
  /// while it stands still.
  std::optional<Nanoseconds> arrival(Nanoseconds length) const;

 private:
  Nanoseconds positionAt(Nanoseconds time) const;

  /// Where it was at `since_`.
  Nanoseconds position_ = 0;
  Nanoseconds since_ = 0;
  double rate_ = 0;
};

/// A position as scripts speak of it.
double inSeconds(Nanoseconds position);

}  // namespace stage
