#include "platform/scripting/spindle_dictionary.h"

#include <algorithm>
#include <iterator>

namespace scripting::spindle {

namespace {

using tarnscript::kApplicationClass;
using tarnscript::Type;

constexpr tarnscript::PropertyTerm kProperties[] = {
    {kApplicationClass, "dvd state", kState, Type::Constant},
    {kApplicationClass, "dvd scan rate", kScanRate, Type::Constant},
    {kApplicationClass, "chapter", kChapter, Type::Integer},
    {kApplicationClass, "available chapters", kAvailableChapters, Type::Integer},
    {kApplicationClass, "elapsed time", kElapsedTime, Type::Integer},
    {kApplicationClass, "dvd menu active", kMenuActive, Type::Boolean},
    {kApplicationClass, "active dvd menu", kActiveMenu, Type::Constant},
    {kApplicationClass, "has media", kHasMedia, Type::Boolean},
    {kApplicationClass, "audio volume", kAudioVolume, Type::Integer},
    {kApplicationClass, "audio muted", kAudioMuted, Type::Boolean},
    {kApplicationClass, "displaying subtitle", kDisplayingSubtitle, Type::Boolean},
    {kApplicationClass, "controller visibility", kControllerVisibility, Type::Boolean},
    {kApplicationClass, "viewer full screen", kViewerFullScreen, Type::Boolean},
};

constexpr tarnscript::CommandTerm kCommands[] = {
    {"play dvd", kPlayDVD, false},
    {"pause dvd", kPauseDVD, false},
    {"stop dvd", kStopDVD, false},
    {"fast forward dvd", kFastForwardDVD, false},
    {"rewind dvd", kRewindDVD, false},
    {"go to main menu", kGoToMainMenu, false},
    {"go to beginning of disc", kGoToBeginning, false},
    {"go return to dvd", kGoReturn, false},
    {"press up arrow key", kPressUp, false},
    {"press down arrow key", kPressDown, false},
    {"press left arrow key", kPressLeft, false},
    {"press right arrow key", kPressRight, false},
    {"press enter key", kPressEnter, false},
};

constexpr tarnscript::ConstantTerm kConstants[] = {
    {"playing", kPlaying},
    {"paused", kPaused},
    {"stopped", kStopped},
    {"idle", kIdle},
    {"x1", kX1},
    {"x2", kX2},
    {"x4", kX4},
    {"x8", kX8},
    {"x16", kX16},
    {"x32", kX32},
    {"main menu", kMainMenu},
    {"no menu", kNoMenu},
};

struct ScanRate {
  Code code;
  double rate;
};

constexpr ScanRate kScanRates[] = {
    {kX1, 1}, {kX2, 2}, {kX4, 4}, {kX8, 8}, {kX16, 16}, {kX32, 32},
};

constexpr tarnscript::Dictionary kDictionary{{}, kProperties, kCommands, {}, kConstants};

}  // namespace

std::optional<double> rateOf(Code scanRate) {
  const auto* const row = std::ranges::find(kScanRates, scanRate, &ScanRate::code);
  if (row == std::end(kScanRates)) return std::nullopt;
  return row->rate;
}

const tarnscript::Dictionary& dictionary() { return kDictionary; }

}  // namespace scripting::spindle
