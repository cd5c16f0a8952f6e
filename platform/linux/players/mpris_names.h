// The names of MPRIS 2.2 on the bus.
#pragma once

#include <optional>
#include <string_view>

#include "platform/linux/players/players.h"

namespace linux::players::mpris {

/// How the bus names of all players begin.
inline constexpr std::string_view kPrefix = "org.mpris.MediaPlayer2.";

inline constexpr const char* kPath = "/org/mpris/MediaPlayer2";
inline constexpr const char* kRootInterface = "org.mpris.MediaPlayer2";
inline constexpr const char* kPlayerInterface = "org.mpris.MediaPlayer2.Player";
inline constexpr const char* kTrackListInterface = "org.mpris.MediaPlayer2.TrackList";
inline constexpr const char* kPropertiesInterface = "org.freedesktop.DBus.Properties";

inline constexpr const char* kPlaybackStatus = "PlaybackStatus";

/// What a text of the property PlaybackStatus means; nothing for any other text.
std::optional<PlaybackStatus> statusNamed(std::string_view text);

}  // namespace linux::players::mpris
