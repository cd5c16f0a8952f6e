// Words of the programs' actions that stand in no dictionary: keys that the core posts without a script, and
// what some words of a dictionary come down to on a program without what they speak of.
#pragma once

#include <cstdint>

#include "platform/tarnscript/tarnscript.h"

namespace linux::programs::words {

using tarnscript::Code;
using tarnscript::code;

inline constexpr Code kShiftS = code("k S ");
inline constexpr Code kReturn = code("kRtn");
inline constexpr Code kSpace = code("kSpc");
inline constexpr Code kEscape = code("kEsc");
inline constexpr Code kRight = code("kRgt");
inline constexpr Code kLeft = code("kLft");
inline constexpr Code kCommandEscape = code("kCEs");

/// The two directions in which albums are walked.
inline constexpr Code kNextAlbum = code("aNxt");
inline constexpr Code kPreviousAlbum = code("aPrv");

/// The two directions in which the chapters of a disc are walked where their numbers are not told.
inline constexpr Code kNextChapter = code("cNxt");
inline constexpr Code kPreviousChapter = code("cPrv");

/// The first and the last slide of a show.
inline constexpr Code kFirstSlide = code("sFst");
inline constexpr Code kLastSlide = code("sLst");

/// Takes the picture of a show away or brings it back.
inline constexpr Code kFreeze = code("sFrz");
/// Brings it back, where a step or a jump does not.
inline constexpr Code kThaw = code("sThw");

/// The word for a key, held with Shift or not; 0 for the many keys that no program takes differently.
Code wordForKey(std::uint16_t virtualKey, bool withShift);

}  // namespace linux::programs::words
