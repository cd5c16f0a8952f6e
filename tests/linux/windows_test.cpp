// Two window systems at once, as XWayland beside a compositor.

#include "platform/linux/windows/windows.h"

#include <gtest/gtest.h>
#include <xkbcommon/xkbcommon.h>

#include <algorithm>

#include "platform/linux/windows/keysyms.h"
#include "platform/linux/windows/none.h"

namespace {

using namespace linux::windows;

struct System {
  std::vector<Window> windows;
  bool knowsFront = true;
  Reach reach = Reach::AnyWindow;
  bool hasOutputs = true;
  std::uint64_t keyFor = 0;
  bool taken = false;
};
System sSystems[2];

template <int which>
Backend backend() {
  Backend made = kNone;
  made.takeIn = [] { return sSystems[which].taken = true; };
  made.list = []() -> const std::vector<Window>& {
    static std::vector<Window> untitled;
    untitled = sSystems[which].windows;
    for (Window& each : untitled) each.title.clear();
    return untitled;
  };
  made.look = [](std::span<Window> windows) {
    for (Window& each : windows) each = *std::ranges::find(sSystems[which].windows, each.id, &Window::id);
  };
  made.knowsFront = [] { return sSystems[which].knowsFront; };
  made.reach = [] { return sSystems[which].reach; };
  made.outputs = [] {
    return sSystems[which].hasOutputs ? std::vector<Output>{{1, {0, 0, 100 * (which + 1), 100}}}
                                      : std::vector<Output>();
  };
  made.sendKey = [](std::uint64_t window, std::uint32_t, bool, Modifiers) {
    sSystems[which].keyFor = window;
    return true;
  };
  return made;
}
const Backend kCompositor = backend<0>();
const Backend kServer = backend<1>();

TEST(Keys, HaveTheSymbolsOfTheirNames) {
  for (const char* name :
       {"space", "BackSpace", "Tab", "Return", "Pause",  "Escape", "Home",  "Left", "Up",    "Right", "Down",
        "Prior", "Next",      "End", "Insert", "Delete", "period", "comma", "plus", "minus", "F1",    "F2",
        "F3",    "F4",        "F5",  "F6",     "F7",     "F8",     "F9",    "F10",  "F11",   "F12"}) {
    EXPECT_EQ(parseKey(name)->keysym, xkb_keysym_from_name(name, XKB_KEYSYM_NO_FLAGS)) << name;
  }
  EXPECT_EQ(parseKey("Control+Shift+a")->modifiers, kControl | kShift);
}

TEST(Windows, OfTwoBackendsAreMerged) {
  const auto window = [](const Backend& of, std::uint64_t number, pid_t process, const char* title,
                         bool active) {
    Window made;
    made.id = {&of, number};
    made.process = process;
    (process == 0 ? made.applicationID : made.className) = title == std::string("Cat") ? "gimp" : "mpv";
    made.title = title;
    made.isActive = active;
    made.isFullScreen = made.isShown = !active;
    made.area = {0, 0, 150, 100};
    return made;
  };
  sSystems[0].reach = Reach::Nobody;
  sSystems[0].windows = {window(kCompositor, 1, 0, "Dune", true), window(kCompositor, 2, 0, "Jaws", false),
                         window(kCompositor, 3, 44, "Cat", false)};
  for (const std::size_t i : {1, 2}) sSystems[0].windows[i].isFullScreen = false;
  sSystems[1].windows = {window(kServer, 7, 42, "Jaws", false), window(kServer, 8, 43, "Cat", true)};
  sSystems[0].windows[1].instanceName = "player";
  sSystems[1].windows[0].instanceName = "other";
  init({&kCompositor, &kServer});
  takeIn();

  ASSERT_EQ(list().size(), 4U) << "both tell of Jaws, each alone of others, be they of the same program";
  EXPECT_EQ(front()->title, "Dune") << "the first that knows is believed";
  EXPECT_TRUE(sSystems[1].taken) << "whatever the first has told";
  EXPECT_FALSE(list()[3].isActive);
  EXPECT_EQ(list()[1].process, 42);
  EXPECT_EQ(list()[1].instanceName, "player");
  const ID jaws[] = {{&kServer, 7}};
  EXPECT_EQ(look(jaws).at(0).applicationID, "mpv") << "a window is known by either number";
  sSystems[0].windows[1].isShown = false;
  EXPECT_FALSE(look(jaws).at(0).isShown) << "it is shown where both say so";
  sSystems[0].windows[1].isShown = true;
  EXPECT_TRUE(sendKey({&kCompositor, 2}, 'a', true, kNoModifier));
  EXPECT_EQ(sSystems[1].keyFor, 7U) << "the server reaches what the compositor does not";
  EXPECT_FALSE(sendKey({&kCompositor, 1}, 'a', true, kNoModifier));
  sSystems[0].reach = Reach::FocusedWindow;
  EXPECT_TRUE(sendKey({&kCompositor, 1}, 'a', true, kNoModifier)) << "it is the one in front";
  sSystems[0].windows[0].isActive = false;
  takeIn();
  EXPECT_FALSE(sendKey({&kCompositor, 1}, 'a', true, kNoModifier));
  EXPECT_TRUE(sendKey({&kCompositor, 1}, 'a', false, kNoModifier)) << "the release is owed all the same";
  EXPECT_TRUE(sendKey({&kCompositor, 9}, 'a', false, kNoModifier)) << "its window has gone meanwhile";
  ASSERT_EQ(outputs().size(), 1U) << "both show on the same";
  EXPECT_FALSE(isCaptured(outputs()[0].id)) << "by the compositor's word no window covers it";
  sSystems[0].hasOutputs = false;
  EXPECT_TRUE(isCaptured(outputs().at(0).id));

  sSystems[0].knowsFront = false;
  std::swap(sSystems[1].windows[0].isActive, sSystems[1].windows[1].isActive);
  takeIn();
  EXPECT_EQ(front()->title, "Jaws");
  finish();
  EXPECT_TRUE(list().empty());
}

}  // namespace
