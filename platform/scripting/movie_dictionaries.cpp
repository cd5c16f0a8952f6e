#include "platform/scripting/movie_dictionaries.h"

namespace scripting::movies {

namespace {

using tarnscript::kApplicationClass;
using tarnscript::Type;

constexpr tarnscript::ClassTerm kClassicClasses[] = {{"movie", "movies", kDocument}};
constexpr tarnscript::ClassTerm kModernClasses[] = {{"document", "documents", kDocument}};

constexpr tarnscript::PropertyTerm kClassicProperties[] = {
    {kApplicationClass, "viewer full screen", kViewerFullScreen, Type::Boolean},
    {kDocument, "name", kName, Type::Text},
    {kDocument, "rate", kRate, Type::Real},
    {kDocument, "playing", kPlaying, Type::Boolean},
    {kDocument, "sound volume", kVolume, Type::Integer},
    {kDocument, "current time", kCurrentTime, Type::Real},
    {kDocument, "duration", kDuration, Type::Real},
};

constexpr tarnscript::PropertyTerm kModernProperties[] = {
    {kDocument, "name", kName, Type::Text},           {kDocument, "rate", kRate, Type::Real},
    {kDocument, "playing", kPlaying, Type::Boolean},  {kDocument, "audio volume", kVolume, Type::Real},
    {kDocument, "sound volume", kVolume, Type::Real}, {kDocument, "current time", kCurrentTime, Type::Real},
    {kDocument, "duration", kDuration, Type::Real},
};

constexpr tarnscript::CommandTerm kClassicCommands[] = {
    {"play", kPlay, true},
    {"pause", kPause, true},
    {"stop", kStop, true},
    {"step forward", kStepForward, true},
    {"step backward", kStepBackward, true},
    {"close", kClose, true},
};

constexpr tarnscript::CommandTerm kModernCommands[] = {
    {"play", kPlay, true},
    {"pause", kPause, true},
    {"stop", kStop, true},
    {"step forward", kStepForward, true},
    {"step backward", kStepBackward, true},
    {"close", kClose, true},
    {"show remote hud", kShowRemoteHUD, false},
};

constexpr tarnscript::Dictionary kClassic{kClassicClasses, kClassicProperties, kClassicCommands, {}, {}};
constexpr tarnscript::Dictionary kModern{kModernClasses, kModernProperties, kModernCommands, {}, {}};

}  // namespace

const tarnscript::Dictionary& classicDictionary() { return kClassic; }

const tarnscript::Dictionary& modernDictionary() { return kModern; }

}  // namespace scripting::movies
