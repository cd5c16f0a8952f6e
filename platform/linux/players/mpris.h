// What a player tells and is told over the session bus (MPRIS 2.2).
//
// A player's playback status is taken from its signals once it has been seen to send them, and asked for
// before that. Optional properties are read with GetAll, never with Get, which makes some players end.
// Operations throw tarnscript::Refusal where the player cannot or will not. A command that is not answered in
// time is taken for done: a busy player comes to it.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "platform/linux/players/players.h"

namespace linux::players {

/// Everything a player tells of itself at one moment. Times in microseconds, volume 1.0 is its full one.
struct PlayerState {
  /// What the player is believed to do, as statusOf answers.
  PlaybackStatus status = PlaybackStatus::Stopped;
  /// As the player says at that moment, which it may take back.
  PlaybackStatus told = PlaybackStatus::Stopped;
  double rate = 1;
  double volume = 1;
  double minimumRate = 1;
  double maximumRate = 1;
  std::int64_t position = 0;
  std::optional<std::int64_t> length;
  /// How many microseconds the player takes for one.
  std::int64_t tick = 1;
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

/// As its signals told, where it sends them, else as it answers.
PlaybackStatus statusOf(Player& player);
/// As it answers now, whatever its signals told, or as last known where it does not answer in time.
PlaybackStatus statusToldBy(Player& player);

/// Whether it plays or has paused something; where it does not answer, whether it did when last known.
bool hasMedia(Player& player);

/// Of org.mpris.MediaPlayer2; nothing where the player does not tell.
std::optional<bool> fullscreenOf(Player& player);

/// The track ids of its play list in their order; empty where the player does not tell.
std::vector<std::string> trackListOf(Player& player);

// Commands. Some players toggle or start over when told to play or pause twice: these act only where the
// status differs.
void play(Player& player);
/// Plays by PlayPause, which must not meet a player that plays already: asks it first.
void toggleToPlay(Player& player);
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

}  // namespace linux::players
