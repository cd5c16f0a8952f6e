#include "platform/terminal/lessons.h"

#include <gtest/gtest.h>

#include "platform/stage/director.h"

namespace {

TEST(Lessons, GoOnWithWhatThePersonGotToSee) {
  const std::pair<std::string_view, std::string_view> steps[] = {
      {"", "Press 2 to open Spindle, the disc player."},
      {"open Lyrabox", "Press 1 again: Lyrabox comes to the front"},
      {"front Lyrabox", "Press Space, the remote's Play/Pause"},
      {"tell Lyrabox to play", "Press Space again to pause it."},
      {"tell Lyrabox to pause", "Space once more"},
      {"tell Lyrabox to play", "Press 2 to open Spindle"},
      {"open Spindle", "Press 2 again: Spindle comes to the front"},
      {"front Spindle", "Press Space: this one plays"},
      {"tell Spindle to play dvd", "Press +"},
      {"volume 51", "? tells all."},
      {"close Lyrabox", "? tells all."},
  };
  stage::useVirtualTime();
  stage::setUpDesktop();
  terminal::Lessons lessons;
  for (const auto& [command, hint] : steps) {
    ASSERT_TRUE(stage::performCommand(std::string(command))) << command;
    lessons.observe(stage::desktop());
    EXPECT_LE(lessons.hint(stage::desktop()).size(), 78u) << "80 columns, one at each end";
    EXPECT_NE(lessons.hint(stage::desktop()).find(hint), std::string::npos) << lessons.hint(stage::desktop());
  }
}

}  // namespace
