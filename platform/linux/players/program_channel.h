// The channels that players offer beside MPRIS2, each for commands of its own kind.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

#include "platform/linux/system/channel.h"

namespace linux::players {

enum class ChannelKind : std::uint8_t { None, Mpv, VlcRc };

/// One of so many, counted from 1.
struct Place {
  int number = 0;
  int count = 0;
};

/// What such a channel can do; null for what it cannot. Functions that return nothing throw
/// tarnscript::Refusal where the program refuses or does not answer.
struct ProgramChannel {
  /// Carries out a command, as the programs' table writes it.
  void (*command)(const system::Listener& listener, std::string_view command);
  /// Shows a text over the picture for a moment. False where that cannot be done.
  bool (*showText)(const system::Listener& listener, std::string_view text);
  /// The title of a disc that plays: 0 of several while a menu shows, of 1 or none for a plain file. Nothing
  /// where it is not known.
  std::optional<Place> (*title)(const system::Listener& listener);
  std::optional<Place> (*chapter)(const system::Listener& listener);
  /// Goes from one chapter to another; a player that stands still may go one on or back only.
  void (*goToChapter)(const system::Listener& listener, int from, int to, bool plays);
  void (*goToTitle)(const system::Listener& listener, int title, std::int64_t seconds);
};

/// Null for None.
const ProgramChannel* channelOf(ChannelKind kind);

}  // namespace linux::players
