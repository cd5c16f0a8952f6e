// The words of the keystroke helper.
#pragma once

#include "platform/tarnscript/tarnscript.h"

namespace scripting::keyhouse {

using tarnscript::Code;
using tarnscript::code;

/// A running application, known by its bundle identifier.
inline constexpr Code kProcess = code("prcs");

inline constexpr Code kKeyCode = code("kcod");
inline constexpr Code kUsing = code("faal");

inline constexpr Code kCommandDown = code("Kcmd");
inline constexpr Code kShiftDown = code("Ksft");
inline constexpr Code kOptionDown = code("Kopt");
inline constexpr Code kControlDown = code("Kctl");

const tarnscript::Dictionary& dictionary();

}  // namespace scripting::keyhouse
