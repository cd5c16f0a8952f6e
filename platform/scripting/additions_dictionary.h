// The words of no application in particular: the output volume, usable in every script.
#pragma once

#include <cstdint>
#include <optional>

#include "platform/tarnscript/tarnscript.h"

namespace scripting::additions {

using tarnscript::Code;
using tarnscript::code;
using tarnscript::Value;

inline constexpr Code kGetVolumeSettings = code("gtvl");
inline constexpr Code kSetVolume = code("stvl");

/// Fields of the record that "get volume settings" answers, and parameters of "set volume".
inline constexpr Code kOutputVolume = code("ouvl");
inline constexpr Code kOutputMuted = code("mute");

const tarnscript::Dictionary& dictionary();

/// What "get volume settings" answers; the volume is 0 to 100.
Value volumeSettings(std::int64_t volume, bool muted);

/// What a "set volume" asks for; it may leave either as it is.
struct VolumeChange {
  std::optional<std::int32_t> volume;
  std::optional<bool> muted;
};
VolumeChange volumeChange(const tarnscript::Event& event);

}  // namespace scripting::additions
