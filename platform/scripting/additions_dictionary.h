// The words of no application in particular: the output volume, usable in every script.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace scripting::additions {

using tarnscript::Code;
using tarnscript::code;

inline constexpr Code kGetVolumeSettings = code("gtvl");
inline constexpr Code kSetVolume = code("stvl");

/// Fields of the record that "get volume settings" answers, and parameters of "set volume".
inline constexpr Code kOutputVolume = code("ouvl");
inline constexpr Code kOutputMuted = code("mute");

const tarnscript::Dictionary& dictionary();

}  // namespace scripting::additions
