// The volume of the default output, through libpulse, which speaks to PulseAudio and to PipeWire alike.
//
// The server is asked when there is a question and tells nothing by itself: other programs' sound never wakes
// kvd, and whatever sink is the default one is found anew each time. The connection is made when it is first
// needed and made again, at most once a turn of the run loop, after it was lost.
#pragma once

#include <optional>
#include <string>

namespace linux::sound {

struct SoundState {
  /// The loudest channel, in percent as volume sliders show it: from 0, and above 100 where it is amplified.
  int volume = 0;
  bool muted = false;
};

/// Closes the connection; a later question makes a new one.
void finish();

/// What the sound server calls itself; empty without one.
std::string serverName();

/// The default sink's; nothing without a server, without a sink, or when no answer comes in time.
std::optional<SoundState> soundState();

/// Sets the loudest channel of the default sink in percent; the other channels keep their proportion to it.
/// False where soundState would be nothing.
bool setOutputVolume(int percent);

/// Mutes or unmutes the default sink. False where soundState would be nothing.
bool setOutputMuted(bool muted);

}  // namespace linux::sound
