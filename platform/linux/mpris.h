// Players on the session bus (MPRIS D-Bus Interface Specification 2.2).
//
// Signals keep the list of players. A player's playback status is taken from its signals once it has been
// seen to send them, and asked for before that. Optional properties are read with GetAll, never with Get,
// which makes some players end. Operations throw tarnscript::Refusal where the player cannot or will not.
#pragma once

#include <cstdint>
#include <list>
#include <optional>
#include <string>

#include "platform/linux/bus.h"

namespace desktop {

enum class PlaybackStatus : std::uint8_t { Playing, Paused, Stopped };

/// One owner of a name that begins with "org.mpris.MediaPlayer2.".
struct Player {
  /// The part of the well-known name after that prefix.
  std::string name;
  /// Its unique name, and the process behind it (that of the proxy for a sandboxed program).
  Callee callee;
  /// Without ".desktop"; empty where the player does not tell.
  std::string desktopEntry;
  /// As its last signal told; nothing while no signal has, and after a command of ours.
  std::optional<PlaybackStatus> status;
};

/// Takes in what the bus has sent. True when players came or went since the last call.
bool takeInPlayers();

/// In the order in which they came to the bus. Addresses stay valid while a player is on the bus.
std::list<Player>& players();

/// Everything a player tells of itself at one moment. Times in microseconds, volume 1.0 is its full one.
struct PlayerState {
  PlaybackStatus status = PlaybackStatus::Stopped;
  double rate = 1;
  double volume = 1;
  double minimumRate = 1;
  double maximumRate = 1;
  std::int64_t position = 0;
  std::optional<std::int64_t> length;
  /// An object path, "" where the player has none that can be sent back to it.
  std::string trackID;
  std::string title;
  bool canSeek = false;
  bool canGoNext = false;
  bool canGoPrevious = false;
};
PlayerState stateOf(Player& player);

PlaybackStatus statusOf(Player& player);

// Commands. Some players toggle or start over when told to play or pause twice: these act only where the
// status differs.
void play(Player& player);
void pause(Player& player);
/// Next, Previous, or another method of org.mpris.MediaPlayer2.Player without arguments.
void invoke(Player& player, const char* member);
/// By so many microseconds, never before the beginning.
void seekBy(Player& player, std::int64_t offset);
void seekTo(Player& player, std::int64_t position);
void setRate(Player& player, double rate);
void setVolume(Player& player, double volume);
/// Of org.mpris.MediaPlayer2; players without the property refuse.
void setFullscreen(Player& player, bool fullscreen);
void raise(Player& player);

}  // namespace desktop
