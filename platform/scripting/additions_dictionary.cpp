#include "platform/scripting/additions_dictionary.h"

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

}  // namespace scripting::additions
