// The volume buttons, the repeat of held buttons, and keys for one application with their times.

#include "routing/volume.h"

#include <gtest/gtest.h>

#include <regex>
#include <sstream>

#include "platform/stage/clock.h"
#include "platform/stage/journal.h"
#include "platform/stage/report.h"
#include "registry/registry.h"
#include "routing/dispatcher.h"
#include "routing/keys.h"
#include "routing/retrigger.h"
#include "tests/core/rehearsal.h"
#include "tests/core/script_texts.h"

// The linker puts these two between the core and what it calls (--wrap): they see what the host cannot tell.
extern "C" {
std::int32_t __real__Z19HostPostEventRecordjPKvji(HostConnectionID, const void*, std::uint32_t, std::int32_t);
bool __real__Z10doDispatchmib(PackedHIDEvent, std::int32_t, bool);

std::int32_t __wrap__Z19HostPostEventRecordjPKvji(HostConnectionID connection, const void* eventRecord,
                                                  std::uint32_t length, std::int32_t option) {
  std::string expected(240, '\0');
  expected.replace(4, 1, "\xF0").replace(8, 1, "\x0E").replace(138, 1, "\x08");  // length, type, subtype
  expected.replace(56, 4, 4, '\xFF');                                            // flags
  std::string bytes(static_cast<const char*>(eventRecord), length);
  bytes.replace(140, 4, 4, '\0');  // the data word, which the journal tells
  if (bytes != expected || option != 0) stage::record(stage::Entry::SoundKey, "a wrong record");
  return __real__Z19HostPostEventRecordjPKvji(connection, eventRecord, length, option);
}

bool __wrap__Z10doDispatchmib(PackedHIDEvent event, std::int32_t value, bool screenLocked) {
  std::ostringstream text;
  text << "repeats " << std::hex << event << " by " << std::dec << value << (screenLocked ? ", locked" : "");
  if (sRetriggerTimer) stage::record(stage::Entry::Service, text.str());
  return __real__Z10doDispatchmib(event, value, screenLocked);
}
}

namespace {

// clang-format off

TEST(Volume, PressesAndReleasesSoundKeysOrLeavesThemToTheTarget) {
  constexpr UsageKey kMenuUp = 0x0001008C, kMenuDown = 0x0001008D, kUp = 0x000C00E9, kDown = 0x000C00EA;
  const std::string up = "volume?; sound key up pressed; +", upFreed = "volume?; sound key up released; +";
  const std::string upAgain = "volume?; sound key up pressed, repeated; +";
  const std::string down = "volume?; sound key down pressed; +";
  const std::string downAgain = "volume?; sound key down pressed, repeated; +";
  const std::string downFreed = "volume?; sound key down released; +";
  const std::string full = "volume?; muted?; sound key up pressed; ", fullLyra = full + "Lyra:volume up; +";
  const std::string lyra = "open lyrabox; front lyrabox; ", lumb = "open lumbra; front lumbra; ";
  const std::string spin = "open spindle; front spindle; ", loud = lyra + "volume 100; mute on";
  const std::string disc = "Spin:menu?; Spin:set audio muted to false; " + full + "Spin:volume up; +";
  const std::string rowUp = "key 126 pressed in Lumbra; key 126 released in Lumbra; +";
  const std::string vist = "volume 100; open com.tarn.vistremeplayer; front com.tarn.vistremeplayer";
  const std::string vstX = "volume 100; open VistremePlayerX; front VistremePlayerX";
  struct Row {
    std::string setUp;
    UsageKey key;
    std::int32_t value;
    std::string event;   ///< what a new event gives
    std::string repeat;  ///< what the same gives as a repeat behind it
  };
  const Row rows[] = {
      {lyra, kMenuUp, 1, up, upAgain}, {lyra, kUp, -1, up, upAgain}, {lyra, kMenuDown, 1, down, downAgain},
      {lyra, kDown, -1, down, downAgain}, {lyra, kMenuUp, 0, upFreed, upFreed},
      {lyra, kUp, 0, upFreed, upFreed}, {lyra, kMenuDown, 0, downFreed, downFreed},
      {lyra, kDown, 0, downFreed, downFreed},
      {lyra + "volume 99", kUp, 1, up, fullLyra}, {lyra + "volume 100", kUp, 1, fullLyra, fullLyra},
      {loud, kMenuUp, 1, "volume?; muted?; unmute; sound key up pressed; Lyra:volume up; +", fullLyra},
      {loud, kDown, 1, down, downAgain}, {loud, kUp, 0, upFreed, upFreed},
      {vist, kUp, 1, full + "Vist:volume up; +", full + "Vist:volume up; +"},
      {vstX, kUp, 1, full + "VstX:volume up; +", full + "VstX:volume up; +"},
      {"volume 100; open slidewell; front slidewell", kUp, 1, full + "+", full + "+"},
      {"volume 100", kUp, 1, full + "+", full + "+"},
      // Two applications take these buttons themselves where they are the target, one of them while none of
      // the first eight displays is captured.
      {spin + "volume 100", kMenuUp, 1, disc, disc}, {spin + lyra, kUp, 1, up, upAgain},
      {lumb + lyra, kUp, 1, up, upAgain}, {lumb, kMenuUp, 1, rowUp, rowUp}, {lumb, kUp, 1, "-", "-"},
      {lumb + "capture 1 on; break display-query", kUp, 1, "-", "-"},
      {lumb + "displays 9; capture 9 on", kUp, 1, "-", "-"},
      {lumb + "displays 9; capture 8 on", kMenuUp, 1, up, upAgain},
      {lyra + "break event-records", kUp, 1, "volume?; +", "volume?; +"},
      {lyra + "break window-server", kDown, 0, "volume?; +", "volume?; +"}};
  for (const Row& row : rows) {
    EXPECT_EQ(named(inChild([&] {
                set(row.setUp);
                gKVDConnection = HostConnectWindowServer();
                sent();
                const bool event = DispatchHIDEvent(eventOf(row.key), row.value, false);
                const std::string first = sent() + (event ? "+" : "-");
                const bool repeat = doDispatch(eventOf(row.key), row.value, false);
                return first + "; " + sent() + (repeat ? "+" : "-");
              })),
              row.event + "; " + row.repeat + "; ")
        << row.setUp << " " << std::hex << row.key << " " << row.value;
  }
}

/// What the daemon does by these commands, once it has started by the first ones.
std::string rehearsed(const std::string& before, const std::string& commands) {
  const std::string all = transcriptOf(before + "\nstart\n" + commands + "\n");
  const std::size_t start = all.find(commands.substr(0, commands.find('\n')) + "\n", all.find("\nstart\n"));
  const std::string told = all.substr(start, all.find("\n  end of input") - start);
  return std::regex_replace(told, std::regex("\n *"), " | ");
}

const std::string kVolume0 = "script: output volume of (get volume settings) = 0";
const std::string kVolume100 = "script: output volume of (get volume settings) = 100 | "
                               "script: output muted of (get volume settings) = false | sound key up pressed | ";
const std::string kRaise = "script to Lyrabox: set sound volume to sound volume + 2 = 102";

TEST(Repeat, OfAVolumeButtonEndsAfterTenSecondsOrAtTheNextEvent) {
  EXPECT_EQ(rehearsed("open lyrabox\nfront lyrabox\nvolume 0\ntell lyrabox to set sound volume to 100",
                      "raw 0x01 0x8D 7 0xFFFE\nwait 15s\n"
                      "lock on\nvolume 100\npress up\nlock off\nwait 1.2s\nrelease menu\nwait 5s"),
            "raw 0x01 0x8D 7 0xFFFE | " + kVolume0 + " | sound key down pressed | timer of 0.1s starts | "
            "wait 15s | +1.05s to +9.95s  ×90: | repeats ea000c by 7 | " + kVolume0 +
            " | sound key down pressed, repeated | +10.05s  timer of 0.1s stops | "
            "lock on | volume 100 | output volume 0 → 100 | press up | " + kVolume100 +
            "asks who is in front: Lyrabox | " + kRaise + " | timer of 0.1s starts | lock off | wait 1.2s | "
            "+1.05s to +1.15s  ×2: | repeats e9000c by 1, locked | " + kVolume100 + kRaise +
            " | release menu | timer of 0.1s stops | asks who is in front: Lyrabox | wait 5s");
  EXPECT_EQ(inChild([] {
              retrigger({0x0C, 0xE9, 0}, 0, 0.1, 10);
              retriggerCallback(nullptr, nullptr);
              stopRetrigger();
              return journal();
            }),
            "") << "a release is not repeated, and nothing where nothing is held";
}

TEST(Repeat, OfAMenuStepHasNoLimitAndFollowsTheMenu) {
  const std::string runs = "asks whether Spindle runs: yes | ";
  const std::string asks = runs + "asks who is in front: Spindle | ";
  const std::string menu =
      "script to Spindle: get dvd menu active = true | script to Spindle: press down arrow key | ";
  const std::string film = "script to Spindle: get dvd menu active = false | ";
  const std::string bottom = "\ntell spindle to press down arrow key\ntell spindle to press down arrow key";
  EXPECT_EQ(rehearsed("open spindle\nfront spindle\nvolume 0\ntell spindle to go to main menu" + bottom,
                      "raw 0x01 0x8D -1 0xFFFE\nwait 20s\ntell spindle to play dvd\nwait 20s\nrelease down"),
            "raw 0x01 0x8D -1 0xFFFE | " + asks + menu + "timer of 0.01s starts | wait 20s | "
            "+1.05s to +20s  ×1896: | repeats fffe008d0001 by -1 | " + runs + menu +
            "tell spindle to play dvd | Spindle: plays chapter 1 at 0:00 | wait 20s | "
            "+0.01s to +20s  ×2000: | repeats fffe008d0001 by -1 | " + runs + film +
            "script to Spindle: set audio muted to false = false | " + kVolume0 +
            " | sound key down pressed, repeated | release down | timer of 0.01s stops | " + asks + film +
            kVolume0 + " | sound key down released");
}

TEST(Keys, ArePressedOneAfterAnother) {
  EXPECT_EQ(rehearsed("open lumbra\nfront lumbra", "press playpause"),
            "press playpause | asks who is in front: Lumbra | key 56 pressed in Lumbra | "
            "+0.01s  key 1 pressed in Lumbra | +0.01s  Lumbra: asks about a slideshow | "
            "+0.06s  key 1 released in Lumbra | +0.07s  key 56 released in Lumbra | "
            "+0.09s  key 36 pressed in Lumbra | +0.09s  Lumbra takes the display | "
            "+0.09s  Lumbra: slideshow at photo 1 | +0.14s  key 36 released in Lumbra");
}

// clang-format on

TEST(Keys, GoToNobodyWhoIsNotFoundAndTakeTheirTime) {
  EXPECT_EQ(inChild([] {
              set("open lumbra; break process-lookup");
              refreshCachedASNs();
              std::string text;
              for (const char* identifier : {"com.tarn.Unknown", Bundle::Snapvale, Bundle::Lumbra}) {
                PostKeyEvent(HostGetConstantString(identifier), 49, false);
                const bool made = stage::aliveText().find("event source ×1") != std::string::npos;
                text += sent() + (made ? "source; " : "none; ");
              }
              for (const char* change : {"mend process-lookup", "close lumbra"}) {
                set(change);
                for (const bool withShift : {false, true}) {
                  const stage::Nanoseconds start = stage::now();
                  PostKeyEvent(HostGetConstantString(Bundle::Lumbra), 49, withShift);
                  text += std::to_string((stage::now() - start) / 1'000'000) + " ms; ";
                }
              }
              return text;
            }),
            "none; none; source; 60 ms; 80 ms; 0 ms; 0 ms; ");
}

}  // namespace
