#include "platform/screen/lessons.h"

#include <gtest/gtest.h>

#include "platform/stage/director.h"

namespace {

TEST(Lessons, GoOnWithWhatThePersonGotToSee) {
  const std::pair<std::string_view, std::string_view> steps[] = {
      {"", "Press 2 to open Spindle, the disc player."},
      {"open Lyrabox", "Press 1 again: Lyrabox comes to the front"},
      {"front Lyrabox", "Press Space, which is Play/Pause"},
      {"tell Lyrabox to play", "Press Space again to pause it."},
      {"tell Lyrabox to pause", "Let it play again (Space), then 2, 2, Space: Spindle plays"},
      {"open Spindle", "Spindle plays, the other stops."},
      {"tell Spindle to play dvd", "Press + for louder."},
      {"volume 51", "? lists the keys."},
      {"close Lyrabox", "? lists the keys."},
  };
  stage::useVirtualTime();
  stage::setUpDesktop();
  live::Lessons lessons;
  for (const auto& [command, hint] : steps) {
    ASSERT_TRUE(stage::performCommand(std::string(command))) << command;
    lessons.observe(stage::desktop());
    EXPECT_NE(lessons.hint(stage::desktop()).find(hint), std::string::npos) << lessons.hint(stage::desktop());
  }
}

TEST(Lessons, LeaveOutWhatHappenedByItself) {
  stage::useVirtualTime();
  stage::setUpDesktop();
  live::Lessons lessons;
  stage::performCommand("open Spindle");
  stage::performCommand("tell Spindle to play dvd");
  lessons.observe(stage::desktop());
  EXPECT_EQ(lessons.hint(stage::desktop()), "Something plays. Press Space again to pause it.");
}

}  // namespace
