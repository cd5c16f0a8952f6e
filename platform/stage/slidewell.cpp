#include "platform/stage/slidewell.h"

#include <algorithm>

#include "platform/scripting/slidewell_dictionary.h"
#include "platform/stage/desktop.h"

namespace stage {

namespace {

namespace words = scripting::slidewell;
using tarnscript::ObjectRef;
using tarnscript::Value;

constexpr int kSlideCount = 12;

}  // namespace

Slidewell::Slidewell() : Application(scripting::kSlidewell, "6.0") {}

const tarnscript::Dictionary& Slidewell::dictionary() const { return words::dictionary(); }

void Slidewell::ended() {
  playing_ = frozen_ = false;
  slide_ = 1;
  switcher_ = 0;
}

std::string Slidewell::describe() const {
  if (!playing_) return "shows no slides";
  const std::string slide = "slide " + std::to_string(slide_) + " of " + std::to_string(kSlideCount);
  if (switcher_ > 0) return slide + ", switcher at " + std::to_string(switcher_);
  return slide + (frozen_ ? ", frozen" : "");
}

void Slidewell::start() {
  if (playing_) return;
  playing_ = true;
  slide_ = 1;
  takeDisplay(*this);
  changed(describe());
}

void Slidewell::stop() {
  if (!playing_) return;
  ended();
  giveDisplayBack(*this);
  changed(describe());
}

void Slidewell::goTo(int slide) {
  if (!playing_) throw tarnscript::Refusal{"no slideshow plays"};
  slide_ = std::clamp(slide, 1, kSlideCount);
  changed(describe());
}

void Slidewell::moveSwitcher(int step) {
  if (switcher_ == 0) throw tarnscript::Refusal{"the slide switcher is hidden"};
  switcher_ = std::clamp(switcher_ + step, 1, kSlideCount);
  changed(describe());
}

void Slidewell::closeSwitcher(bool accept) {
  if (switcher_ == 0) throw tarnscript::Refusal{"the slide switcher is hidden"};
  if (accept) slide_ = switcher_;
  switcher_ = 0;
  changed(describe());
}

Value Slidewell::read(const ObjectRef& object, tarnscript::Code property) {
  switch (property) {
    case words::kPlaying:
      return playing_;
    case words::kFrozen:
      return frozen_;
    case words::kSwitcherVisible:
      return switcher_ > 0;
    case words::kName:
      return std::string("Field Notes");
    default:
      return Application::read(object, property);
  }
}

void Slidewell::write(const ObjectRef& object, tarnscript::Code property, const Value& value) {
  if (property != words::kFrozen) return Application::write(object, property, value);
  if (!playing_) throw tarnscript::Refusal{"no slideshow plays"};
  frozen_ = tarnscript::toInt32(value) != 0;
  changed(describe());
}

std::vector<ObjectRef> Slidewell::list(const ObjectRef& object, tarnscript::Code cls) {
  if (object.cls == tarnscript::kApplicationClass && cls == words::kSlideshow)
    return {{this, words::kSlideshow, 1}};
  if (object.cls != words::kSlideshow || cls != words::kSlide) return Application::list(object, cls);
  std::vector<ObjectRef> slides;
  for (std::uint64_t slide = 1; slide <= kSlideCount; ++slide) slides.push_back({this, words::kSlide, slide});
  return slides;
}

Value Slidewell::obey(const tarnscript::Event& event) {
  switch (event.command) {
    case words::kStart:
      start();
      break;
    case words::kStop:
      stop();
      break;
    case words::kShowNext:
      goTo(slide_ + 1);
      break;
    case words::kShowPrevious:
      goTo(slide_ - 1);
      break;
    case words::kShow: {
      const auto* const shown = event.direct ? std::get_if<ObjectRef>(&*event.direct) : nullptr;
      if (shown == nullptr || shown->application != this || shown->cls != words::kSlide) {
        throw tarnscript::Refusal{"only slides can be shown"};
      }
      goTo(static_cast<int>(shown->id));
      break;
    }
    case words::kShowSwitcher:
      if (!playing_) throw tarnscript::Refusal{"no slideshow plays"};
      switcher_ = slide_;
      changed(describe());
      break;
    case words::kAcceptSwitcher:
      closeSwitcher(true);
      break;
    case words::kCancelSwitcher:
      closeSwitcher(false);
      break;
    case words::kSwitcherForward:
      moveSwitcher(1);
      break;
    case words::kSwitcherBackward:
      moveSwitcher(-1);
      break;
    default:
      return Application::obey(event);
  }
  return {};
}

}  // namespace stage
