#include "platform/scripting/additions_dictionary.h"

#include <map>
#include <memory>

namespace scripting::additions {

namespace {

using tarnscript::kApplicationClass;
using tarnscript::Type;

constexpr tarnscript::PropertyTerm kProperties[] = {
    {kApplicationClass, "output volume", kOutputVolume, Type::Integer},
    {kApplicationClass, "output muted", kOutputMuted, Type::Boolean},
};

constexpr tarnscript::CommandTerm kCommands[] = {
    {"get volume settings", kGetVolumeSettings, false},
    {"set volume", kSetVolume, false},
};

constexpr tarnscript::ParameterTerm kParameters[] = {
    {kSetVolume, "output volume", kOutputVolume, Type::Integer},
    {kSetVolume, "output muted", kOutputMuted, Type::Boolean},
};

constexpr tarnscript::Dictionary kDictionary{{}, kProperties, kCommands, kParameters, {}};

}  // namespace

const tarnscript::Dictionary& dictionary() { return kDictionary; }

Value volumeSettings(std::int64_t volume, bool muted) {
  return std::make_shared<const std::map<Code, Value>>(
      std::map<Code, Value>{{kOutputVolume, volume}, {kOutputMuted, muted}});
}

VolumeChange volumeChange(const tarnscript::Event& event) {
  VolumeChange change;
  const auto volume = event.parameters.find(kOutputVolume);
  if (volume != event.parameters.end()) change.volume = tarnscript::toInt32(volume->second);
  const auto muted = event.parameters.find(kOutputMuted);
  if (muted != event.parameters.end()) change.muted = tarnscript::toInt32(muted->second) != 0;
  return change;
}

}  // namespace scripting::additions
