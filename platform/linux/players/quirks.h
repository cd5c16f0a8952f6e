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
  /// Nobody knows what it is like.
  kUnknown = 8,
  /// A browser: it is a player for as long as a page has something to play.
  kNeedsMedia = 16,
  /// An extension that speaks for a browser, which may speak for itself too.
  kSpeaksForBrowser = 32,
  /// After seeks while it plays it may stand still for good, and say that it plays; quick ones most of all.
  kStallsOnSeeks = 64,
  /// Its older versions tell and take milliseconds where microseconds are meant.
  kCountsMilliseconds = 128,
};
using Quirks = std::uint8_t;

}  // namespace linux::players
