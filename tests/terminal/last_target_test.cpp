#include "platform/terminal/last_target.h"

#include <clocale>

#include <gtest/gtest.h>

#include "daemon/lifecycle.h"
#include "platform/stage/desktop.h"
#include "platform/stage/director.h"
#include "routing/dispatcher.h"

namespace {

TEST(LastTarget, TellsWhyFromWhatTheDaemonAsked) {
  struct Step {
    std::string command;
    UsageKey button;
    std::wstring text;
  };
  const std::wstring nobody = L"nobody: no player is in front, plays or runs";
  const Step steps[] = {
      {"", Key::VolumeIncrement, L"the output volume, whoever plays"},
      {"", Key::ScanNextTrack, nobody},
      {"open Spindle", Key::Menu, L"Spindle: it is the first player that runs"},
      {"open Lyrabox", Key::Menu, L"Lyrabox: it is the first player that runs"},
      {"tell Spindle to play dvd", Key::Menu, L"Spindle: it plays or shows its menu"},
      {"tell Spindle to stop dvd", Key::Menu, L"Spindle: it was chosen last"},
      {"open com.example.Editor", Key::Menu, L"Spindle: it was chosen last"},
      {"front Editor", Key::VolumeIncrement, L"the output volume; Spindle: it was chosen last"},
      {"front Lyrabox", Key::Menu, L"Lyrabox: it is in front"},
      {"tell Spindle to play dvd", Key::Menu, L"Lyrabox: it is in front"},
      {"front nobody", Key::Menu, L"Spindle: it plays or shows its menu"},
      {"close Spindle", Key::Menu, L"Lyrabox: it is the first player that runs"},
      {"tell Lyrabox to play", Key::Menu, L"Lyrabox: it plays"},
      {"tell Lyrabox to stop", Key::Menu, L"Lyrabox: it was chosen last"},
      {"open Snapvale", Key::Menu, L"Lyrabox: it was chosen last"},
      {"front Snapvale", Key::Menu, L"Snapvale: it is in front"},
      {"front nobody", Key::Menu, L"Lyrabox: it is the first player that runs"},
      {"close Lyrabox", Key::Menu, nobody},
  };
  std::setlocale(LC_CTYPE, "C.UTF-8");
  stage::setUpDesktop();
  gKVDConnection = HostConnectWindowServer();
  terminal::LastTarget target;
  stage::beginRehearsal({}, [&](const stage::JournalLine& line) { target.note(line); });
  stage::useVirtualTime();
  for (const Step& step : steps) {
    ASSERT_TRUE(stage::performCommand(step.command)) << step.command;
    DispatchHIDEvent(PackHIDEvent({static_cast<std::uint16_t>(step.button >> 16),
                                   static_cast<std::uint16_t>(step.button), 0}),
                     1, true);
    target.settle();
    EXPECT_EQ(target.text(), step.text) << "after " << step.command;
    // The idle check asks too, and chooses nothing.
    idleKillTimerCallback({}, nullptr);
    target.settle();
    EXPECT_EQ(target.text(), step.text) << "after " << step.command;
  }
  stage::setJournalListener(nullptr);
}

}  // namespace
