#include "platform/scripting/keyhouse_dictionary.h"

namespace scripting::keyhouse {

namespace {

using tarnscript::Type;

constexpr tarnscript::ClassTerm kClasses[] = {{"process", "processes", kProcess}};

constexpr tarnscript::CommandTerm kCommands[] = {{"key code", kKeyCode, true}};

constexpr tarnscript::ParameterTerm kParameters[] = {{kKeyCode, "using", kUsing, Type::Constant}};

constexpr tarnscript::ConstantTerm kConstants[] = {
    {"command down", kCommandDown},
    {"shift down", kShiftDown},
    {"option down", kOptionDown},
    {"control down", kControlDown},
};

constexpr tarnscript::Dictionary kDictionary{kClasses, {}, kCommands, kParameters, kConstants};

}  // namespace

const tarnscript::Dictionary& dictionary() { return kDictionary; }

}  // namespace scripting::keyhouse
