#include "platform/scripting/slidewell_dictionary.h"

namespace scripting::slidewell {

namespace {

using tarnscript::kApplicationClass;
using tarnscript::Type;

constexpr tarnscript::ClassTerm kClasses[] = {
    {"slideshow", "slideshows", kSlideshow},
    {"slide", "slides", kSlide},
};

constexpr tarnscript::PropertyTerm kProperties[] = {
    {kApplicationClass, "playing", kPlaying, Type::Boolean},
    {kApplicationClass, "frozen", kFrozen, Type::Boolean},
    {kApplicationClass, "slide switcher visible", kSwitcherVisible, Type::Boolean},
    {kSlideshow, "name", kName, Type::Text},
};

constexpr tarnscript::CommandTerm kCommands[] = {
    {"start slideshow", kStart, false},
    {"stop slideshow", kStop, false},
    {"show", kShow, true},
    {"show next slide", kShowNext, false},
    {"show previous slide", kShowPrevious, false},
    {"show slide switcher", kShowSwitcher, false},
    {"accept slide switcher", kAcceptSwitcher, false},
    {"cancel slide switcher", kCancelSwitcher, false},
    {"move slide switcher forward", kSwitcherForward, false},
    {"move slide switcher backward", kSwitcherBackward, false},
};

constexpr tarnscript::Dictionary kDictionary{kClasses, kProperties, kCommands, {}, {}};

}  // namespace

const tarnscript::Dictionary& dictionary() { return kDictionary; }

}  // namespace scripting::slidewell
