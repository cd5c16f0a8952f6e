// The words of the presentation application.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace scripting::slidewell {

using tarnscript::Code;
using tarnscript::code;

inline constexpr Code kSlideshow = code("shws");
inline constexpr Code kSlide = code("slid");

inline constexpr Code kPlaying = code("pply");
inline constexpr Code kFrozen = code("pfrz");
inline constexpr Code kSwitcherVisible = code("psws");
inline constexpr Code kName = code("pnam");

inline constexpr Code kStart = code("sSta");
inline constexpr Code kStop = code("sStp");
inline constexpr Code kShow = code("sShw");
inline constexpr Code kShowNext = code("sNxt");
inline constexpr Code kShowPrevious = code("sPrv");
inline constexpr Code kShowSwitcher = code("sSws");
inline constexpr Code kAcceptSwitcher = code("sSwa");
inline constexpr Code kCancelSwitcher = code("sSwc");
inline constexpr Code kSwitcherForward = code("sSwf");
inline constexpr Code kSwitcherBackward = code("sSwb");

const tarnscript::Dictionary& dictionary();

}  // namespace scripting::slidewell
