// Words of deeds() that stand in no dictionary: keys that the core posts without a script, and the two
// directions in which albums are walked.
#pragma once

#include <cstdint>

#include "platform/tarnscript/tarnscript.h"

namespace desktop {

namespace words {

using tarnscript::Code;
using tarnscript::code;

inline constexpr Code kShiftS = code("k S ");
inline constexpr Code kReturn = code("kRtn");
inline constexpr Code kSpace = code("kSpc");
inline constexpr Code kEscape = code("kEsc");
inline constexpr Code kCommandEscape = code("kCEs");

inline constexpr Code kNextAlbum = code("aNxt");
inline constexpr Code kPreviousAlbum = code("aPrv");

}  // namespace words

/// The word for a key, held with Shift or not; 0 for the many keys that no program takes differently.
tarnscript::Code wordForKey(std::uint16_t virtualKey, bool withShift);

/// What the users' tables call such a word; null for words of a dictionary.
const char* nameOfOwnWord(tarnscript::Code word);

}  // namespace desktop
