#include "platform/linux/players/mpris_names.h"

namespace linux::players::mpris {

std::optional<PlaybackStatus> statusNamed(std::string_view text) {
  if (text == "Playing") return PlaybackStatus::Playing;
  if (text == "Paused") return PlaybackStatus::Paused;
  if (text == "Stopped") return PlaybackStatus::Stopped;
  return std::nullopt;
}

}  // namespace linux::players::mpris
