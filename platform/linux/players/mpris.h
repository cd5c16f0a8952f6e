// Players on the session bus (MPRIS 2.2).
//
// Signals keep the list of players. A player's playback status is taken from its signals once it has been
// seen to send them, and asked for before that. Optional properties are read with GetAll, never with Get,
// which makes some players end. Operations throw tarnscript::Refusal where the player cannot or will not.
#pragma once

#include <cstdint>
#include <list>
#include <optional>
#include <string>
#include <vector>

#include "platform/linux/system/bus.h"

namespace desktop {

enum class PlaybackStatus : std::uint8_t { Playing, Paused, Stopped };

/// The status that a command leads to: believed for a moment, as many players answer the command first and do
/// it then, and some say that they are paused while they seek.
struct Wish {
  PlaybackStatus status;
  /// On the clock of HostAbsoluteTime.
  double until;
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
  Callee callee;
  /// Without ".desktop"; empty where the player does not tell.
  std::string desktopEntry;
  Introduction introduction = Introduction::Refused;
  /// As its last signal told; nothing while no signal has, and after a command of ours.
  std::optional<PlaybackStatus> status;
  std::optional<Wish> wish;
  /// Its rate before it was made to play faster; nothing while it plays at its own.
  std::optional<double> ownRate;
};

/// Takes in what the bus has sent. True when players came or went since the last call, or told their desktop
/// entry. Waits for that once, for each player that has come.
bool takeInPlayers();

/// In the order in which they came to the bus. Addresses stay valid while a player is on the bus.
std::list<Player>& players();

/// Everything a player tells of itself at one moment. Times in microseconds, volume 1.0 is its full one.
struct PlayerState {
  /// As statusOf answers.
  PlaybackStatus status = PlaybackStatus::Stopped;
  /// As the player says at that moment, which it may take back.
  PlaybackStatus told = PlaybackStatus::Stopped;
  double rate = 1;
  double volume = 1;
  double minimumRate = 1;
  double maximumRate = 1;
  std::int64_t position = 0;
  std::optional<std::int64_t> length;
  /// An object path, "" where the player has none that can be sent back to it.
  std::string trackID;
  /// The name of the file where what plays has no title.
  std::string title;
  /// What it plays, an address.
  std::string url;
  bool canSeek = false;
  bool canGoNext = false;
  bool canGoPrevious = false;
};
PlayerState stateOf(Player& player);

PlaybackStatus statusOf(Player& player);

/// Of org.mpris.MediaPlayer2; nothing where the player does not tell.
std::optional<bool> fullscreenOf(Player& player);

/// The track ids of its play list in their order; empty where the player does not tell.
std::vector<std::string> trackListOf(Player& player);

// Commands. Some players toggle or start over when told to play or pause twice: these act only where the
// status differs.
void play(Player& player);
void pause(Player& player);
/// Ends what plays; in some players, the player.
void stop(Player& player);
/// Plays an entry of trackListOf from its beginning.
void goToTrack(Player& player, const std::string& trackID);
/// Next, Previous, or another method of org.mpris.MediaPlayer2.Player without arguments.
void invoke(Player& player, const char* member);
/// Times in microseconds; before the beginning is the beginning.
void seekBy(Player& player, std::int64_t offset);
void seekTo(Player& player, std::int64_t position);
/// As seekTo, where the player's state is known already.
void seekTo(Player& player, const PlayerState& state, std::int64_t position);
/// Whether a player in this state can be set to a rate and honours it.
bool takesRate(const Player& player, const PlayerState& state, double rate);
void setRate(Player& player, double rate);
void setVolume(Player& player, double volume);
/// Of org.mpris.MediaPlayer2; players without the property refuse.
void setFullscreen(Player& player, bool fullscreen);
void raise(Player& player);

}  // namespace desktop
