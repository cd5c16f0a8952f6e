// Which application gets a button, and what the dispatcher makes of it.

#include <gtest/gtest.h>

#include <set>

#include "registry/registry.h"
#include "remote/buttons.h"
#include "routing/dispatcher.h"
#include "routing/target.h"
#include "tests/core/rehearsal.h"

namespace {

/// One event: what is done on the desktop before it, and the target that it then has.
struct Step {
  const char* before;
  const char* target;
};

std::string targetsAfter(const std::vector<Step>& steps) {
  return inChild([&] {
    std::string targets;
    for (const Step& step : steps) {
      set(step.before);
      refreshCachedASNs();
      sTargetApplication = App::Nval;
      targets += codeText(targetApplication()) + " ";
    }
    return targets;
  });
}

TEST(Target, IsFrontmostElsePlayingElseLastElseFirst) {
  const std::vector<std::vector<Step>> rows = {
      {{"", "none"}},
      {{"open com.example.Editor; front com.example.Editor", "none"}},
      {{"open lyrabox; open com.tarn.Snapvale; front com.tarn.Snapvale", "Snap"}},
      {{"open com.tarn.Lumbra; front com.tarn.Lumbra", "Lumb"}},
      {{"open com.tarn.Spindle; front com.tarn.Spindle", "Spin"}},
      {{"open com.tarn.vistremeplayer; front com.tarn.vistremeplayer", "Vist"}},
      {{"open com.tarn.VistremePlayerX; front com.tarn.VistremePlayerX", "VstX"}},
      {{"open com.tarn.Officra.Slidewell; front com.tarn.Officra.Slidewell", "Slid"}},
      // The same letters in another case name another application.
      {{"open com.tarn.lyrabox; front com.tarn.lyrabox", "none"}},
      {{"open com.tarn.VistremePlayer; front com.tarn.VistremePlayer", "none"}},
      // Merely running counts last, in the order of priority; photo and slide applications never do.
      {{"open com.tarn.vistremeplayer", "Vist"},
       {"open com.tarn.VistremePlayerX", "VstX"},
       {"open com.tarn.Spindle", "Spin"},
       {"open lyrabox", "Lyra"}},
      {{"open com.tarn.Snapvale; open com.tarn.Lumbra; open com.tarn.Officra.Slidewell", "none"}},
      // What was in front keeps the remote while it runs and nothing else plays.
      {{"open lyrabox; open com.tarn.Spindle; front com.tarn.Spindle", "Spin"},
       {"front nobody", "Spin"},
       {"tell lyrabox to play", "Lyra"},
       {"tell lyrabox to stop", "Lyra"},
       {"close lyrabox", "Spin"}},
      // Priority alone is not remembered.
      {{"open com.tarn.Spindle", "Spin"}, {"open lyrabox", "Lyra"}, {"close lyrabox", "Spin"}},
      // What has quit is forgotten for good.
      {{"open com.tarn.vistremeplayer; front com.tarn.vistremeplayer", "Vist"},
       {"close com.tarn.vistremeplayer; open lyrabox", "Lyra"},
       {"open com.tarn.vistremeplayer", "Lyra"}},
      // A photo or slide application in front is a target, and forgotten when it leaves.
      {{"open slidewell; front slidewell; open lyrabox", "Slid"}, {"front nobody", "Lyra"}},
      {{"open com.tarn.vistremeplayer; front com.tarn.vistremeplayer", "Vist"},
       {"open com.tarn.Snapvale; front com.tarn.Snapvale; open lyrabox", "Snap"},
       {"front nobody", "Lyra"}},
      // A disc player that shows its menu counts as playing.
      {{"open lyrabox; open spindle; tell spindle to go to main menu", "Spin"}},
      // Of those that play, the first in an order of its own.
      {{"open lyrabox; tell lyrabox to play; open spindle; tell spindle to play dvd; open VistremePlayerX; "
        "tell VistremePlayerX to play front document; open com.tarn.vistremeplayer; "
        "tell com.tarn.vistremeplayer to play front movie; open slidewell; tell slidewell to start slideshow",
        "Lyra"},
       {"tell lyrabox to stop", "Spin"},
       {"tell spindle to stop dvd", "VstX"},
       {"tell VistremePlayerX to stop front document", "Vist"},
       {"tell com.tarn.vistremeplayer to stop front movie", "Slid"}},
      // Paused is not playing.
      {{"open lyrabox; open com.tarn.Spindle; front com.tarn.Spindle; tell lyrabox to play; tell lyrabox to "
        "pause",
        "Spin"},
       {"front nobody", "Spin"}},
  };
  for (const std::vector<Step>& steps : rows) {
    std::string expected;
    for (const Step& step : steps) expected += std::string(step.target) + " ";
    EXPECT_EQ(targetsAfter(steps), expected) << steps.back().before;
  }
}

TEST(Target, IsAskedOncePerEvent) {
  EXPECT_EQ(inChild([] {
              set("open lyrabox");
              refreshCachedASNs();
              std::string targets = codeText(targetApplication());
              set("open com.tarn.Spindle; front com.tarn.Spindle; close lyrabox");
              targets += codeText(targetApplication());
              DispatchHIDEvent(eventOf(Key::Menu), 1, false);
              targets += codeText(targetApplication());
              set("close com.tarn.Spindle");
              DispatchHIDEvent(eventOf(Key::Menu), 1, false);
              targets += codeText(targetApplication());
              journal();
              targetApplication();
              return targets + " " + journal();
            }),
            "LyraLyraSpinnone ")
      << "a target of none is remembered too";
}

/// What a dispatch sends to applications, and "+" when it was handled.
std::string dispatched(const std::string& before, PackedHIDEvent event, std::int32_t value, bool locked) {
  return inChild([&] {
    set(before);
    sent();
    const bool handled = DispatchHIDEvent(event, value, locked);
    return sent() + (handled ? "+" : "");
  });
}

TEST(Dispatcher, LaunchesTheJukeboxWhenNobodyIsThere) {
  const std::string launch = "tell application id \"com.tarn.Lyrabox\" to launch; ";
  const std::set<UsageKey> launching = {Key::SystemMenuSelect, Key::Play, Key::Pause, Key::PlayPause};
  const std::set<UsageKey> volume = {Key::SystemMenuUp, Key::SystemMenuDown, Key::VolumeIncrement,
                                     Key::VolumeDecrement};
  for (const remote::Button& button : remote::buttons()) {
    const UsageKey key = UsageKeyOf(button.usagePage, button.usage);
    if (volume.contains(key)) continue;
    for (const std::int32_t value : {1, 0}) {
      EXPECT_EQ(dispatched("", eventOf(key), value, false), launching.contains(key) ? launch : "")
          << button.name;
      EXPECT_EQ(dispatched("", eventOf(key), value, true), "") << button.name;
    }
  }
}

TEST(Dispatcher, RoutesByTheLow48Bits) {
  const std::string toggle = "tell application id \"com.tarn.Lyrabox\" to playpause; +";
  const std::string front = "open lyrabox; front lyrabox";
  const PackedHIDEvent event = eventOf(Key::PlayPause);
  EXPECT_EQ(dispatched(front, event, 1, false), toggle);
  EXPECT_EQ(dispatched(front, event, 1, true), toggle) << "a locked screen does not stop routing";
  EXPECT_EQ(dispatched(front, event | 0xFFFF'0000'0000, 1, false), toggle) << "the extra field";
  EXPECT_EQ(dispatched(front, event | 0xFFFF'0000'0000'0000, 1, false), toggle) << "bits above the event";
}

TEST(Dispatcher, FollowsTheApplicationListAndKeepsTheTargetOfARepeat) {
  EXPECT_EQ(
      inChild([] {
        set("open lyrabox; front lyrabox");
        DispatchHIDEvent(eventOf(Key::Menu), 1, true);
        const std::string refreshed = journal();
        DispatchHIDEvent(eventOf(Key::Menu), 1, false);
        const std::string unchanged = journal();
        set("open com.tarn.Spindle; front com.tarn.Spindle");
        journal();
        const bool kept = doDispatch(eventOf(Key::Stop), 1, false);
        return refreshed + "--\n" + unchanged + "--\n" + journal() + (kept ? "kept" : "lost") +
               (sScreenLocked ? " locked" : "");
      }),
      "Lyrabox starts\nLyrabox comes to the front\nfinds Lyrabox running\nasks who is in front: Lyrabox\n--\n"
      "asks who is in front: Lyrabox\n--\n"
      "finds Lyrabox running\nfinds Spindle running\n"
      "script to Lyrabox: stop\nkept");
}

}  // namespace
