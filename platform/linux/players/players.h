// The players on the session bus (MPRIS 2.2): who has come and left, who they say they are, and what status
// they tell. Signals keep the list.
#pragma once

#include <cstdint>
#include <list>
#include <optional>
#include <string>
#include <string_view>

#include "platform/base/deadline.h"
#include "platform/linux/players/quirks.h"
#include "platform/linux/system/bus.h"

namespace linux::players {

enum class PlaybackStatus : std::uint8_t { Playing, Paused, Stopped };

/// The status that a command leads to: believed until the command has been answered and for a moment after
/// that, as many players answer first and do it then, and some say that they are paused while they seek.
struct Wish {
  PlaybackStatus status;
  base::Deadline until;
};

/// How far a player is with telling who it is.
enum class Introduction : std::uint8_t {
  Awaited,   ///< asked, and worth waiting for
  Late,      ///< asked, and once waited for in vain
  Refused,   ///< asked too early: its answer was an error
  Complete,  ///< what it told is in
};

/// One owner of a name that begins with "org.mpris.MediaPlayer2.".
struct Player {
  /// The part of the well-known name after that prefix.
  std::string name;
  /// Its unique name, and the process behind it (that of the proxy for a sandboxed program).
  system::Callee callee;
  /// Without ".desktop"; empty where the player does not tell.
  std::string desktopEntry;
  Introduction introduction = Introduction::Refused;
  /// The bus has answered, or was waited for in vain.
  bool processIsKnown = false;
  /// As its last signal told; nothing while no signal has, and after a command of ours.
  std::optional<PlaybackStatus> status;
  std::optional<Wish> wish;
  /// As it was last told, believed or answered: what is gone by where a question is not answered in time.
  std::optional<PlaybackStatus> lastKnown;
  /// Its rate before it was made to play faster; nothing while it plays at its own.
  std::optional<double> ownRate;
  /// When it was last seen to begin playing, as nextUse counts; 0 for never.
  std::uint64_t lastPlayed = 0;
  /// Of the program that it is known to be.
  Quirks quirks = kNoQuirk;
  /// For the answers that it owes: who it is, to the last command that was not waited for.
  system::Slot introducing, commanding;
};

/// Counts, from 1, what is done to players and by them, so that the later of two can be told.
std::uint64_t nextUse();

/// Takes in what the bus has sent. True when players came or went since the last call, told their desktop
/// entry, or (browsers) something of what they play. Waits once for each player that has come, for its entry.
bool takeInPlayers();

/// In the order in which they came to the bus. Addresses stay valid while a player is on the bus.
std::list<Player>& list();

/// The player with this unique name; null when it has left.
Player* findPlayer(std::string_view owner);

/// Counts the commands to players and what they began or ended by themselves.
std::uint64_t playbackChanges();

/// What a command of a moment ago leads to; nothing when there was none.
std::optional<PlaybackStatus> believedCommand(const Player& player);

/// What the player is believed to do: as its last signal told, or as believedCommand. Nothing when it must be
/// asked.
std::optional<PlaybackStatus> believedStatus(const Player& player);

/// From here on the player is believed to do this.
void believe(Player& player, PlaybackStatus status);
/// The command has been answered: from here on it is believed for a moment only.
void settle(Player& player);

}  // namespace linux::players
