// The words of the music jukebox.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace scripting::lyrabox {

using tarnscript::Code;
using tarnscript::code;

inline constexpr Code kTrack = code("cTrk");

inline constexpr Code kPlayerState = code("pPlS");
inline constexpr Code kPlayerPosition = code("pPos");
inline constexpr Code kSoundVolume = code("pVol");
inline constexpr Code kCurrentTrack = code("pTrk");
inline constexpr Code kName = code("pnam");
inline constexpr Code kDuration = code("pDur");

inline constexpr Code kStopped = code("kPSS");
inline constexpr Code kPlaying = code("kPSP");
inline constexpr Code kPaused = code("kPSU");
inline constexpr Code kFastForwarding = code("kPSF");
inline constexpr Code kRewinding = code("kPSR");

inline constexpr Code kPlay = code("Play");
inline constexpr Code kPause = code("Paus");
inline constexpr Code kPlayPause = code("PlPs");
inline constexpr Code kStop = code("Stop");
inline constexpr Code kResume = code("Resu");
inline constexpr Code kFastForward = code("Fast");
inline constexpr Code kRewind = code("Rwnd");
inline constexpr Code kNextTrack = code("Next");
inline constexpr Code kBackTrack = code("Back");

const tarnscript::Dictionary& dictionary();

}  // namespace scripting::lyrabox
