#include "platform/scripting/lyrabox_dictionary.h"

namespace scripting::lyrabox {

namespace {

using tarnscript::kApplicationClass;
using tarnscript::Type;

constexpr tarnscript::ClassTerm kClasses[] = {
    {"application", "applications", kApplicationClass},
    {"track", "tracks", kTrack},
};

constexpr tarnscript::PropertyTerm kProperties[] = {
    {kApplicationClass, "player state", kPlayerState, Type::Constant},
    {kApplicationClass, "player position", kPlayerPosition, Type::Real},
    {kApplicationClass, "sound volume", kSoundVolume, Type::Integer},
    {kApplicationClass, "current track", kCurrentTrack, Type::Object},
    {kTrack, "name", kName, Type::Text},
    {kTrack, "duration", kDuration, Type::Real},
};

constexpr tarnscript::CommandTerm kCommands[] = {
    {"play", kPlay, true},      {"pause", kPause, false},          {"playpause", kPlayPause, false},
    {"stop", kStop, false},     {"resume", kResume, false},        {"fast forward", kFastForward, false},
    {"rewind", kRewind, false}, {"next track", kNextTrack, false}, {"back track", kBackTrack, false},
};

constexpr tarnscript::ConstantTerm kConstants[] = {
    {"stopped", kStopped},     {"playing", kPlaying},
    {"paused", kPaused},       {"fast forwarding", kFastForwarding},
    {"rewinding", kRewinding},
};

constexpr tarnscript::Dictionary kDictionary{kClasses, kProperties, kCommands, {}, kConstants};

}  // namespace

const tarnscript::Dictionary& dictionary() { return kDictionary; }

}  // namespace scripting::lyrabox
