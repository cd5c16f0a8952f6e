// What a person did at a rehearsal in real time, kept so that it can be played again.
#pragma once

#include <string>
#include <vector>

#include "platform/stage/clock.h"

namespace stage {

/// A moment of the rehearsal.
struct Moment {
  Nanoseconds time = 0;   ///< since the beginning, without the sleeps of the daemon
  Nanoseconds slept = 0;  ///< how long those take in virtual time
};

class Recording {
 public:
  void add(std::string command, Moment moment);
  /// The commands as those of a transcript, one a line, with the times between them and up to `end`. A press
  /// and its release become a hold.
  std::string commands(Moment end) const;

 private:
  struct Done {
    std::string command;
    Moment moment;
  };

  static bool isHold(const Done& first, const Done& second);

  std::vector<Done> done_;
};

}  // namespace stage
