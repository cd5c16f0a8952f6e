// The words of the two movie players: the classic one speaks of movies, the modern one of documents.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace scripting::movies {

using tarnscript::Code;
using tarnscript::code;

/// A movie of the classic player, a document of the modern one.
inline constexpr Code kDocument = code("docu");

inline constexpr Code kName = code("pnam");
inline constexpr Code kRate = code("prat");
inline constexpr Code kPlaying = code("ppla");
/// The modern player has two words for it.
inline constexpr Code kVolume = code("pvol");
inline constexpr Code kCurrentTime = code("pcti");
inline constexpr Code kDuration = code("pdur");
inline constexpr Code kViewerFullScreen = code("pvfs");

inline constexpr Code kPlay = code("mPly");
inline constexpr Code kPause = code("mPau");
inline constexpr Code kStop = code("mStp");
inline constexpr Code kStepForward = code("mFwd");
inline constexpr Code kStepBackward = code("mBwd");
inline constexpr Code kClose = code("mCls");
inline constexpr Code kShowRemoteHUD = code("mHUD");

const tarnscript::Dictionary& classicDictionary();
const tarnscript::Dictionary& modernDictionary();

}  // namespace scripting::movies
