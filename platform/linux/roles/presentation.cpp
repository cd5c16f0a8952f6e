#include "platform/linux/roles/presentation.h"

#include <algorithm>
#include <string>

#include "platform/linux/programs/own_words.h"
#include "platform/linux/roles/perform.h"
#include "platform/linux/roles/role_application.h"
#include "platform/linux/roles/show_window.h"
#include "platform/scripting/slidewell_dictionary.h"

namespace linux::roles {

namespace {

namespace slidewell = scripting::slidewell;
namespace words = programs::words;
using tarnscript::Event;
using tarnscript::ObjectRef;
using tarnscript::Refusal;
using tarnscript::Value;
using windows::Window;

/// The slides that can be asked for; how many lie between them, nobody tells.
enum Slide : std::uint64_t { kFirstSlide = 1, kLastSlide = 2 };

/// The program as if the show's window were its only one. Throws Refusal when no show plays.
Performer shown(const Performer& performer) {
  const Window* const show = showWindow(performer);
  if (show == nullptr) throw Refusal{"no show plays"};
  return performer.in(*show);
}

class Presentation final : public RoleApplication {
 public:
  Presentation() : RoleApplication(programs::Role::Presentation) {}

  const tarnscript::Dictionary& dictionary() const override { return slidewell::dictionary(); }

 protected:
  Value getBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property) override;
  void setBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property,
             const Value& value) override;
  std::vector<ObjectRef> elementsBy(const Performer& performer, const ObjectRef& object,
                                    tarnscript::Code cls) override;
  Value performBy(const Performer& performer, const Event& event) override;

 private:
  bool isFrozen(const Window* show) const { return show != nullptr && show->id && show->id == frozenIn_; }
  void start(const Performer& performer);
  void stop(const Performer& performer);
  void jump(const Performer& performer, const Event& event);
  void move(const Performer& performer, tarnscript::Code word);

  /// The show whose picture was taken away with the key for it. Programs do not tell, so it is remembered;
  /// the next show has another window or begins unfrozen.
  windows::ID frozenIn_;
};

Value Presentation::getBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property) {
  switch (property) {
    case slidewell::kPlaying:
      return showWindow(performer) != nullptr;
    case slidewell::kFrozen:
      return isFrozen(showWindow(performer));
    case slidewell::kSwitcherVisible:
      return false;
    case slidewell::kName: {
      const Window* const window = performer.keyboardWindow();
      return window != nullptr ? window->title : std::string();
    }
    default:
      return RoleApplication::getBy(performer, object, property);
  }
}

void Presentation::setBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property,
                         const Value& value) {
  if (property != slidewell::kFrozen) return RoleApplication::setBy(performer, object, property, value);
  const bool freeze = tarnscript::toInt32(value) != 0;
  const Performer show = shown(performer);
  const Window& window = show.windows().front();
  if (freeze == isFrozen(&window)) return;
  roles::perform(show, words::kFreeze);
  frozenIn_ = freeze ? window.id : windows::ID();
}

std::vector<ObjectRef> Presentation::elementsBy(const Performer& performer, const ObjectRef& object,
                                                tarnscript::Code cls) {
  if (object.cls == tarnscript::kApplicationClass && cls == slidewell::kSlideshow) {
    return {{this, slidewell::kSlideshow, 1}};
  }
  if (object.cls == slidewell::kSlideshow && cls == slidewell::kSlide) {
    return {{this, slidewell::kSlide, kFirstSlide}, {this, slidewell::kSlide, kLastSlide}};
  }
  return RoleApplication::elementsBy(performer, object, cls);
}

Value Presentation::performBy(const Performer& performer, const Event& event) {
  switch (event.command) {
    case slidewell::kStart:
      start(performer);
      return {};
    case slidewell::kStop:
      stop(performer);
      return {};
    case slidewell::kShow:
      jump(performer, event);
      return {};
    case slidewell::kShowNext:
    case slidewell::kShowPrevious:
      move(performer, event.command);
      return {};
    default:
      return RoleApplication::performBy(performer, event);
  }
}

void Presentation::start(const Performer& performer) {
  if (showWindow(performer) != nullptr) return;
  const auto documents = documentWindows(performer);
  if (documents.empty()) throw Refusal{"no document is open"};
  frozenIn_ = {};
  const auto active = std::ranges::find_if(documents, &Window::isActive);
  roles::perform(performer.in(active != documents.end() ? **active : *documents.front()), slidewell::kStart);
}

/// Also said to a program that shows nothing: that must not disturb whoever works on slides.
void Presentation::stop(const Performer& performer) {
  const Window* const window = showWindow(performer);
  if (window == nullptr) return;
  const Performer show = performer.in(*window);
  // Where the picture is taken away, the first key only brings it back.
  if (isFrozen(window)) roles::perform(show, slidewell::kStop);
  frozenIn_ = {};
  roles::perform(show, slidewell::kStop);
}

void Presentation::jump(const Performer& performer, const Event& event) {
  const auto* const slide = event.direct ? std::get_if<ObjectRef>(&*event.direct) : nullptr;
  if (slide == nullptr || slide->application != this || slide->cls != slidewell::kSlide) {
    throw Refusal{"only slides can be shown"};
  }
  move(performer, slide->id == kFirstSlide ? words::kFirstSlide : words::kLastSlide);
}

/// A step or a jump, which brings the picture back.
void Presentation::move(const Performer& performer, tarnscript::Code word) {
  const Performer show = shown(performer);
  if (isFrozen(&show.windows().front()) && programs::hasOwnAction(show.program(), words::kThaw)) {
    roles::perform(show, words::kThaw);
  }
  roles::perform(show, word);
  frozenIn_ = {};
}

}  // namespace

tarnscript::Application& presentation() {
  static Presentation application;
  return application;
}

}  // namespace linux::roles
