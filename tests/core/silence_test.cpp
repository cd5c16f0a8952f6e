// Silencing, by its rule: whoever runs and is not the one that plays, in order.

#include "routing/silence.h"

#include <gtest/gtest.h>

#include "registry/registry.h"
#include "tests/core/rehearsal.h"
#include "tests/core/script_texts.h"

namespace {

struct Silenced {
  AppCode code;
  std::string name;
  std::string sentWhenItRuns;  ///< of the disc player, its first question
};

// clang-format off
const Silenced kOrder[] = {
    {App::Lyra, "lyrabox", "Lyra:pause if playing; "},
    {App::Snap, "snapvale", "Snap:stop; "},
    {App::Lumb, "lumbra", "key 53 pressed in Lumbra; key 53 released in Lumbra; "},
    {App::Spin, "spindle", "Spin:menu?; "},
    {App::VstX, "VistremePlayerX", "VstX:stop front document; "},
    {App::Vist, "com.tarn.vistremeplayer", "Vist:stop front movie; "},
    {App::Slid, "slidewell", "Slid:stop slideshow; "},
};

/// The states of a disc player that runs, and what it is sent.
const std::pair<std::string, std::string> kDiscStates[] = {
    {"tell spindle to stop dvd", "Spin:state?; "},
    {"tell spindle to play dvd", "Spin:state?; Spin:pause dvd; "},
    {"tell spindle to go to main menu", "Spin:stop dvd; "},
};
// clang-format on

TEST(Silence, ReachesEveryOtherThatRuns) {
  for (unsigned running = 0; running < 1U << std::size(kOrder); ++running) {
    const auto runs = [&](std::size_t i) { return (running >> i & 1) != 0; };
    EXPECT_EQ(inChild([&] {
                set("capture 1 on");
                for (std::size_t i = 0; i < std::size(kOrder); ++i) {
                  if (runs(i)) set("open " + kOrder[i].name);
                }
                refreshCachedASNs();
                std::string wrong;
                for (const auto& [state, answer] : kDiscStates) {
                  for (const AppCode code : {App::Lyra, App::Snap, App::Lumb, App::Spin, App::VstX, App::Vist,
                                             App::Slid, App::None, App::Nval}) {
                    if (SpindleIsRunning()) set(state);
                    std::string expected;
                    for (std::size_t i = 0; i < std::size(kOrder); ++i) {
                      if (!runs(i) || kOrder[i].code == code) continue;
                      expected += kOrder[i].sentWhenItRuns + (kOrder[i].code == App::Spin ? answer : "");
                    }
                    sent();
                    SilenceAllBut(code);
                    const std::string actual = named(sent());
                    if (actual != expected)
                      wrong.append(codeText(code)).append(", " + state + ": ").append(actual);
                  }
                }
                return wrong;
              }),
              "")
        << "running: " << running;
  }
}

}  // namespace
