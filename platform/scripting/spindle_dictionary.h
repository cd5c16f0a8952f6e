// The words of the disc player.
#pragma once

#include <optional>

#include "platform/tarnscript/tarnscript.h"

namespace scripting::spindle {

using tarnscript::Code;
using tarnscript::code;

inline constexpr Code kState = code("dvST");
inline constexpr Code kScanRate = code("dvSR");
inline constexpr Code kChapter = code("dvCh");
inline constexpr Code kAvailableChapters = code("dvAC");
inline constexpr Code kElapsedTime = code("dvET");
inline constexpr Code kMenuActive = code("dvMA");
inline constexpr Code kActiveMenu = code("dvAM");
inline constexpr Code kHasMedia = code("dvHM");
inline constexpr Code kAudioVolume = code("dvAV");
inline constexpr Code kAudioMuted = code("dvMu");
inline constexpr Code kDisplayingSubtitle = code("dvSu");
inline constexpr Code kControllerVisibility = code("dvCV");
inline constexpr Code kViewerFullScreen = code("dvFS");

inline constexpr Code kPlaying = code("espl");
inline constexpr Code kPaused = code("espa");
inline constexpr Code kStopped = code("esps");
inline constexpr Code kIdle = code("esid");

/// Scan rates; rateOf() tells how fast they are.
inline constexpr Code kX1 = code("xs01");
inline constexpr Code kX2 = code("xs02");
inline constexpr Code kX4 = code("xs04");
inline constexpr Code kX8 = code("xs08");
inline constexpr Code kX16 = code("xs16");
inline constexpr Code kX32 = code("xs32");

inline constexpr Code kMainMenu = code("emma");
inline constexpr Code kNoMenu = code("emno");

inline constexpr Code kPlayDVD = code("cPly");
inline constexpr Code kPauseDVD = code("cPau");
inline constexpr Code kStopDVD = code("cStp");
inline constexpr Code kFastForwardDVD = code("cFwd");
inline constexpr Code kRewindDVD = code("cRew");
inline constexpr Code kGoToMainMenu = code("cMMn");
inline constexpr Code kGoToBeginning = code("cBeg");
inline constexpr Code kGoReturn = code("cRet");
inline constexpr Code kPressUp = code("cKUp");
inline constexpr Code kPressDown = code("cKDn");
inline constexpr Code kPressLeft = code("cKLf");
inline constexpr Code kPressRight = code("cKRt");
inline constexpr Code kPressEnter = code("cKEn");

/// How many times as fast as the film runs a scan rate is, 1 to 32; nothing for a code that is none.
std::optional<double> rateOf(Code scanRate);

const tarnscript::Dictionary& dictionary();

}  // namespace scripting::spindle
