#include "platform/scripting/snapvale_dictionary.h"

namespace scripting::snapvale {

namespace {

using tarnscript::kApplicationClass;
using tarnscript::Type;

constexpr tarnscript::ClassTerm kClasses[] = {{"album", "albums", kAlbum}};

constexpr tarnscript::PropertyTerm kProperties[] = {
    {kApplicationClass, "slideshow running", kSlideshowRunning, Type::Boolean},
    {kApplicationClass, "current album", kCurrentAlbum, Type::Object},
    {kAlbum, "name", kName, Type::Text},
    {kAlbum, "id", kID, Type::Integer},
};

constexpr tarnscript::CommandTerm kCommands[] = {
    {"select", kSelect, true},
    {"start slideshow", kStartSlideshow, false},
    {"stop slideshow", kStopSlideshow, false},
};

constexpr tarnscript::Dictionary kDictionary{kClasses, kProperties, kCommands, {}, {}};

}  // namespace

const tarnscript::Dictionary& dictionary() { return kDictionary; }

}  // namespace scripting::snapvale
