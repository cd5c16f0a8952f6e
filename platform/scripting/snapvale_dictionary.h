// The words of the consumer photo library, of all its generations together.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace scripting::snapvale {

using tarnscript::Code;
using tarnscript::code;

inline constexpr Code kAlbum = code("ipal");

inline constexpr Code kSlideshowRunning = code("pssr");
inline constexpr Code kCurrentAlbum = code("pcal");
inline constexpr Code kName = code("pnam");
inline constexpr Code kID = code("ID  ");

inline constexpr Code kSelect = code("pSel");
inline constexpr Code kStartSlideshow = code("pSSt");
inline constexpr Code kStopSlideshow = code("pSSp");

const tarnscript::Dictionary& dictionary();

}  // namespace scripting::snapvale
