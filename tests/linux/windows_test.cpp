// Two window systems at once, as XWayland beside a compositor.

#include "platform/linux/windows/windows.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "platform/linux/windows/none.h"

namespace {

using namespace linux::windows;

struct System {
  std::vector<Window> windows;
  bool knowsFront = true;
  Reach reach = Reach::AnyWindow;
  bool hasOutputs = true;
  std::uint64_t keyFor = 0;
};
System sSystems[2];

template <int which>
Backend backend() {
  Backend made = kNone;
  made.takeIn = [] { return true; };
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
  sSystems[0].windows = {window(kCompositor, 1, 0, "Dune", true), window(kCompositor, 2, 0, "Jaws", false)};
  sSystems[0].windows[1].isFullScreen = false;
  sSystems[1].windows = {window(kServer, 7, 42, "Jaws", false), window(kServer, 8, 43, "Cat", true)};
  init({&kCompositor, &kServer});
  takeIn();

  ASSERT_EQ(list().size(), 3U) << "both tell of Jaws, each alone of another window";
  EXPECT_EQ(front()->title, "Dune") << "the first that knows is believed";
  EXPECT_EQ(list()[1].process, 42);
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
  ASSERT_EQ(outputs().size(), 1U) << "both show on the same";
  EXPECT_FALSE(isCaptured(outputs()[0].id)) << "by the compositor's word no window covers it";
  sSystems[0].hasOutputs = false;
  EXPECT_TRUE(isCaptured(outputs().at(0).id));

  sSystems[0].knowsFront = false;
  takeIn();
  EXPECT_EQ(front()->title, "Cat");
  finish();
  EXPECT_TRUE(list().empty());
}

}  // namespace
