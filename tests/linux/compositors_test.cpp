// What compositors tell of windows in languages of their own.

#include <gtest/gtest.h>

#include "platform/linux/windows/wlr/hyprland.h"

namespace {

TEST(Compositors, HyprlandTellsWhoseWindowsThereAreAndWhichAreShown) {
  constexpr char kMonitors[] = R"([
    {"id": 0, "name": "DP-1", "activeWorkspace": {"id": 1}, "specialWorkspace": {"id": 0}},
    {"id": 1, "name": "DP-2", "activeWorkspace": {"id": 3}, "specialWorkspace": {"id": -99}}])";
  constexpr char kClients[] = R"([7,
    {"address": "0x5601", "mapped": true, "hidden": false, "workspace": {"id": 1}, "monitor": 0, "class": "mpv",
     "title": "Dune", "pid": 42},
    {"address": "0x5602", "mapped": true, "hidden": false, "workspace": {"id": 2}, "monitor": 0},
    {"address": "0x5603", "mapped": true, "hidden": false, "workspace": {"id": -99}, "monitor": 1},
    {"address": "0x5604", "mapped": true, "hidden": true, "workspace": {"id": 3}, "monitor": 1},
    {"address": "0x5605", "mapped": true, "workspace": 5, "monitor": 0},
    {"address": "0x5606", "mapped": false, "workspace": {"id": 1}, "monitor": 0}])";
  const auto windows = linux::windows::wlr::hyprlandWindowsIn(kClients, kMonitors);
  ASSERT_EQ(windows.size(), 5U);
  EXPECT_EQ(windows[0].id, 0x5601);
  EXPECT_EQ(windows[0].process, 42);
  EXPECT_EQ(windows[0].applicationID + windows[0].title + windows[0].output, "mpvDuneDP-1");
  const bool shown[] = {true, false, true, false, false};
  for (std::size_t i = 0; i < windows.size(); ++i) EXPECT_EQ(windows[i].isVisible, shown[i]) << i;
  EXPECT_TRUE(linux::windows::wlr::hyprlandWindowsIn("[{", "").empty());
}

}  // namespace
