#include "platform/stage/spindle.h"

#include <algorithm>
#include <cmath>
#include <iterator>

#include "platform/scripting/spindle_dictionary.h"
#include "platform/stage/quantities.h"

namespace stage {

namespace {

namespace words = scripting::spindle;
using tarnscript::Constant;
using tarnscript::Value;

/// Lengths of the film's chapters in seconds.
constexpr int kChapters[] = {312, 428, 605, 377, 540, 290};
constexpr int kChapterCount = std::size(kChapters);

constexpr const char* kMenuItems[] = {"Play the film", "Chapter 4", "Subtitles"};
constexpr int kMenuItemCount = std::size(kMenuItems);
constexpr int kMenuChapter = 4;

/// Where a chapter, counted from 1, begins; one past the last gives the film's end.
Nanoseconds startOf(int chapter) {
  Nanoseconds start = 0;
  for (int i = 1; i < chapter; ++i) start += kChapters[i - 1] * kSecond;
  return start;
}

Nanoseconds filmLength() { return startOf(kChapterCount + 1); }

}  // namespace

Spindle::Spindle() : Application(scripting::kSpindle, "5.1"), scanRate_(words::kX2) {}

const tarnscript::Dictionary& Spindle::dictionary() const { return words::dictionary(); }

void Spindle::ended() {
  state_ = State::Stopped;
  playhead_ = {};
}

void Spindle::setDisc(bool present) {
  if (hasDisc_ == present) return;
  hasDisc_ = present;
  ended();
  changed(present ? "takes the disc in" : "gives the disc out");
}

int Spindle::chapter() const {
  int number = 1;
  while (number < kChapterCount && playhead_.position() >= startOf(number + 1)) ++number;
  return number;
}

std::optional<Nanoseconds> Spindle::nextChange() const { return playhead_.arrival(filmLength()); }

void Spindle::advance() {
  for (auto end = nextChange(); end && *end <= now(); end = nextChange()) {
    const bool forward = playhead_.rate() > 0;
    playhead_.seek(0, *end);
    if (forward) {
      enter(State::Menu, 0, *end);
    } else {
      enter(State::Playing, 1, *end);
    }
  }
}

std::string Spindle::describe() const {
  if (!hasDisc_) return "has no disc";
  const std::string place = "chapter " + std::to_string(chapter()) + " at " +
                            positionText(playhead_.position() - startOf(chapter()));
  switch (state_) {
    case State::Stopped:
      return "stopped";
    case State::Menu:
      return std::string("shows the disc menu, at \"") + kMenuItems[menuItem_] + '"';
    case State::Paused:
      return "paused in " + place;
    case State::Playing:
      break;
  }
  if (playhead_.rate() == 1) return "plays " + place;
  return std::string("scans ") + (playhead_.rate() > 0 ? "forward" : "back") + " ×" +
         std::to_string(static_cast<int>(std::abs(playhead_.rate()))) + " from " + place;
}

std::string Spindle::details() const {
  return "volume " + std::to_string(volume_) + (muted_ ? ", muted" : "") + (subtitles_ ? ", subtitles" : "");
}

void Spindle::enter(State state, double rate, Nanoseconds when) {
  if (state == state_ && rate == playhead_.rate()) return;
  state_ = state;
  playhead_.setRate(rate, when);
  changed(describe());
}

void Spindle::seek(Nanoseconds position, Nanoseconds when) {
  playhead_.seek(position, when);
  changed("goes to chapter " + std::to_string(chapter()));
}

void Spindle::stepInMenu(int step) {
  if (state_ != State::Menu) return;
  const int item = std::clamp(menuItem_ + step, 0, kMenuItemCount - 1);
  if (item == menuItem_) return;
  menuItem_ = item;
  changed(std::string("menu at \"") + kMenuItems[item] + '"');
}

void Spindle::chooseFromMenu() {
  if (state_ != State::Menu) return;
  if (menuItem_ == 2) {
    subtitles_ = !subtitles_;
    changed(subtitles_ ? "subtitles on" : "subtitles off");
    return;
  }
  playhead_.seek(menuItem_ == 0 ? 0 : startOf(kMenuChapter));
  enter(State::Playing, 1);
}

Value Spindle::read(const tarnscript::ObjectRef& object, tarnscript::Code property) {
  switch (property) {
    case words::kState:
      if (!hasDisc_) return Constant{words::kIdle};
      if (state_ == State::Playing) return Constant{words::kPlaying};
      return Constant{state_ == State::Paused ? words::kPaused : words::kStopped};
    case words::kScanRate:
      return Constant{scanRate_};
    case words::kChapter:
      return std::int64_t{chapter()};
    case words::kAvailableChapters:
      return std::int64_t{hasDisc_ ? kChapterCount : 0};
    case words::kElapsedTime:
      return std::int64_t{playhead_.position() / kSecond};
    case words::kMenuActive:
      return state_ == State::Menu;
    case words::kActiveMenu:
      return Constant{state_ == State::Menu ? words::kMainMenu : words::kNoMenu};
    case words::kHasMedia:
      return hasDisc_;
    case words::kAudioVolume:
      return std::int64_t{volume_};
    case words::kAudioMuted:
      return muted_;
    case words::kDisplayingSubtitle:
      return subtitles_;
    case words::kControllerVisibility:
      return controllerVisible_;
    case words::kViewerFullScreen:
      return fullScreen_;
    default:
      return Application::read(object, property);
  }
}

void Spindle::write(const tarnscript::ObjectRef& object, tarnscript::Code property, const Value& value) {
  const auto setFlag = [&](bool& flag, const std::string& what) {
    const bool wanted = tarnscript::toInt32(value) != 0;
    if (flag != wanted) changed(what + (wanted ? " on" : " off"));
    flag = wanted;
  };
  switch (property) {
    case words::kScanRate:
      if (!words::rateOf(tarnscript::toTypeCode(value))) throw tarnscript::Refusal{"there is no such rate"};
      scanRate_ = tarnscript::toTypeCode(value);
      break;
    case words::kChapter: {
      const int wanted = tarnscript::toInt32(value);
      if (!hasDisc_ || wanted < 1 || wanted > kChapterCount)
        throw tarnscript::Refusal{"there is no such chapter"};
      seek(startOf(wanted));
      break;
    }
    case words::kAudioVolume: {
      const int previous = volume_;
      volume_ = std::clamp(tarnscript::toInt32(value), 0, 255);
      if (volume_ != previous)
        changed("volume " + std::to_string(previous) + " → " + std::to_string(volume_));
      break;
    }
    case words::kAudioMuted:
      setFlag(muted_, "mute");
      break;
    case words::kDisplayingSubtitle:
      setFlag(subtitles_, "subtitles");
      break;
    case words::kControllerVisibility:
      setFlag(controllerVisible_, "controller");
      break;
    case words::kViewerFullScreen:
      setFlag(fullScreen_, "full screen");
      break;
    default:
      Application::write(object, property, value);
  }
}

Value Spindle::obey(const tarnscript::Event& event) {
  if (!hasDisc_) throw tarnscript::Refusal{"there is no disc"};
  const double scanRate = *words::rateOf(scanRate_);
  const bool canScan = state_ == State::Playing || state_ == State::Paused;
  switch (event.command) {
    case words::kPlayDVD:
      enter(State::Playing, 1);
      break;
    case words::kPauseDVD:
      if (state_ == State::Playing) enter(State::Paused, 0);
      break;
    case words::kStopDVD:
      playhead_.seek(0);
      enter(State::Stopped, 0);
      break;
    case words::kFastForwardDVD:
      if (canScan) enter(State::Playing, scanRate);
      break;
    case words::kRewindDVD:
      if (canScan) enter(State::Playing, -scanRate);
      break;
    case words::kGoToMainMenu:
      menuItem_ = 0;
      enter(State::Menu, 0);
      break;
    case words::kGoToBeginning:
      if (state_ == State::Menu) enter(State::Stopped, 0);
      seek(0);
      break;
    case words::kGoReturn:
      if (state_ == State::Menu) enter(State::Playing, 1);
      break;
    case words::kPressUp:
      stepInMenu(-1);
      break;
    case words::kPressDown:
      stepInMenu(1);
      break;
    case words::kPressLeft:
    case words::kPressRight:
      break;  // The menu is one column.
    case words::kPressEnter:
      chooseFromMenu();
      break;
    default:
      return Application::obey(event);
  }
  return {};
}

}  // namespace stage
