#include "platform/stage/recording.h"

#include <gtest/gtest.h>

namespace {

constexpr stage::Nanoseconds kMillisecond = 1'000'000;

TEST(Recording, WritesWhatWasDoneWithItsTimes) {
  struct Done {
    std::string command;
    double time;  ///< in milliseconds
    double slept;
  };
  const std::pair<std::vector<Done>, std::string> cases[] = {
      {{}, "start\nwait 10s\n"},
      {{{"tap play", 1500.9, 0}, {"tap next", 1502, 60}},
       "start\nwait 1.5s\ntap play\ntap next\nwait 8.5s\n"},
      {{{"tap play", 3, 0}, {"tap play", 6, 0}}, "start\ntap play\nwait 0.006s\ntap play\nwait 9.994s\n"},
      {{{"press up", 0, 0}, {"release up", 2000.7, 0}}, "start\nhold up 2s\nwait 8s\n"},
      {{{"press up", 100.9, 40}, {"release up", 2000.1, 180}}, "start\nwait 0.1s\nhold up 2.04s\nwait 8s\n"},
      {{{"press up", 0, 0}, {"tap play", 1000, 0}, {"release up", 2000, 0}},
       "start\npress up\nwait 1s\ntap play\nwait 1s\nrelease up\nwait 8s\n"},
      {{{"press up", 0, 0}, {"release down", 1000, 0}}, "start\npress up\nwait 1s\nrelease down\nwait 9s\n"},
      {{{"press up", 0, 0}, {"release up", 1, 0}}, "start\npress up\nrelease up\nwait 10s\n"},
      {{{"press up", 9999, 0}}, "start\nwait 9.999s\npress up\n"},
  };
  for (const auto& [commands, text] : cases) {
    stage::Recording recording;
    for (const auto& [command, time, slept] : commands) {
      recording.add(command, {static_cast<stage::Nanoseconds>(time * kMillisecond),
                              static_cast<stage::Nanoseconds>(slept * kMillisecond)});
    }
    EXPECT_EQ(recording.commands({10'000 * kMillisecond, 0}), text);
  }
}

}  // namespace
