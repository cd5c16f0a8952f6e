// The presentation program: a document is open, and its show plays in a full-screen window.

#include <algorithm>
#include <string>
#include <string_view>

#include "platform/linux/system/bus.h"
#include "platform/linux/roles/deeds.h"
#include "platform/linux/players/gtk_actions.h"
#include "platform/linux/windows/keystrokes.h"
#include "platform/linux/roles/role_application.h"
#include "platform/linux/roles/show_window.h"
#include "platform/scripting/slidewell_dictionary.h"

namespace desktop {

namespace {

namespace slidewell = scripting::slidewell;
using tarnscript::Event;
using tarnscript::ObjectRef;
using tarnscript::Refusal;
using tarnscript::Value;

/// The slides that can be asked for; how many lie between them, nobody tells.
enum Slide : std::uint64_t { kFirstSlide = 1, kLastSlide = 2 };

/// As okular names itself on the bus; its keys for this work only while its window is in front.
bool startInOkular(const Instance& instance) {
  const std::string name = "org.kde.okular-" + std::to_string(instance.process);
  return nameHasOwner(name.c_str()) &&
         send({name, instance.process}, {"/okular", "org.kde.okular", "slotTogglePresentation"}, "");
}

class Presentation final : public RoleApplication {
 public:
  Presentation() : RoleApplication(Role::Presentation) {}

  const tarnscript::Dictionary& dictionary() const override { return slidewell::dictionary(); }

  Value get(const ObjectRef& object, tarnscript::Code property) override {
    switch (property) {
      case slidewell::kPlaying:
        return show() != 0;
      case slidewell::kFrozen:
        return isFrozen(show());
      case slidewell::kSwitcherVisible:
        return false;
      case slidewell::kName:
        return textProperty(keyboardWindow(instance()), "_NET_WM_NAME");
      default:
        return RoleApplication::get(object, property);
    }
  }

  void set(const ObjectRef& object, tarnscript::Code property, const Value& value) override {
    if (property != slidewell::kFrozen) return RoleApplication::set(object, property, value);
    const bool freeze = tarnscript::toInt32(value) != 0;
    const Instance shown = shownInstance();
    if (freeze == isFrozen(shown.windows.front())) return;
    type(shown, "b");
    frozenIn_ = freeze ? shown.windows.front() : 0;
  }

  std::vector<ObjectRef> elements(const ObjectRef& object, tarnscript::Code cls) override {
    if (object.cls == tarnscript::kApplicationClass && cls == slidewell::kSlideshow) {
      return {{this, slidewell::kSlideshow, 1}};
    }
    if (object.cls == slidewell::kSlideshow && cls == slidewell::kSlide) {
      return {{this, slidewell::kSlide, kFirstSlide}, {this, slidewell::kSlide, kLastSlide}};
    }
    return RoleApplication::elements(object, cls);
  }

  Value perform(const Event& event) override {
    switch (event.command) {
      case slidewell::kStart:
        start();
        return {};
      case slidewell::kStop:
        stop();
        return {};
      case slidewell::kShow:
        jump(event);
        return {};
      case slidewell::kShowNext:
      case slidewell::kShowPrevious:
        desktop::perform(shownInstance(), event.command);
        // A step brings the picture back.
        frozenIn_ = 0;
        return {};
      default:
        return RoleApplication::perform(event);
    }
  }

 private:
  /// The window in which the show plays; 0 when none does.
  Window show() const { return showWindow(instance()); }

  bool isFrozen(Window show) const { return show != 0 && show == frozenIn_; }

  /// The program as if the show's window were its only one, so that keys go there.
  Instance shownInstance() const {
    const Window window = show();
    if (window == 0) throw Refusal{"no show plays"};
    Instance shown = instance();
    shown.windows = {window};
    return shown;
  }

  void start() {
    Instance open = instance();
    if (showWindow(open) != 0) return;
    open.windows = documentWindows(open);
    if (open.windows.empty()) throw Refusal{"no document is open"};
    frozenIn_ = 0;
    const bool isOkular =
        open.program != nullptr && open.program->entry == std::string_view("org.kde.okular");
    if (!isOkular || !startInOkular(open)) desktop::perform(open, slidewell::kStart);
  }

  /// Also said to a program that shows nothing: that must not disturb whoever works on slides.
  void stop() {
    const Window window = show();
    if (window == 0) return;
    const Instance shown = shownInstance();
    // Where the picture is taken away, the first key only brings it back.
    if (isFrozen(window)) type(shown, "Escape");
    frozenIn_ = 0;
    desktop::perform(shown, slidewell::kStop);
  }

  void jump(const Event& event) {
    const auto* const slide = event.direct ? std::get_if<ObjectRef>(&*event.direct) : nullptr;
    if (slide == nullptr || slide->application != this || slide->cls != slidewell::kSlide) {
      throw Refusal{"only slides can be shown"};
    }
    type(shownInstance(), slide->id == kFirstSlide ? "Home" : "End");
    frozenIn_ = 0;
  }

  /// The show whose picture was taken away with the key for it. Programs do not tell, so it is remembered;
  /// the next show has another window or begins unfrozen.
  Window frozenIn_ = 0;
};

}  // namespace

tarnscript::Application& presentation() {
  static Presentation thePresentation;
  return thePresentation;
}

}  // namespace desktop
