// What players do differently from what MPRIS2 promises.
#pragma once

#include <cstdint>

namespace linux::players {

enum Quirk : std::uint8_t {
  kNoQuirk = 0,
  /// Takes a Rate and goes on as before.
  kIgnoresRate = 1,
  /// Raise succeeds and raises nothing.
  kIgnoresRaise = 2,
  /// Play does nothing when it stands still; PlayPause plays.
  kIgnoresPlay = 4,
};
using Quirks = std::uint8_t;

}  // namespace linux::players
