// Scripts against applications: words, objects, commands, and applications that do not answer.
#include <gtest/gtest.h>

#include "tests/tarnscript/fakes.h"

namespace tarnscript {
namespace {

std::string tell(const std::string& body) {
  return "tell application id \"com.tarn.Player\"\n" + body + "\nend tell";
}

struct Case {
  const char* body;
  const char* expected;
};

/// Each body in a tell of the player.
void expectAll(std::initializer_list<Case> cases) {
  for (const auto& [body, expected] : cases) EXPECT_EQ(runScript(tell(body)), expected) << body;
}

TEST(Objects, AreAddressedInManyWays) {
  expectAll({
      {"front document", "docu#1"},
      {"the last document", "docu#2"},
      {"DOCUMENT 2", "docu#2"},
      {"set n to 1\nalbum (n + 1)", "albm#2"},
      {"set n to 3\nalbum n", "albm#3"},
      {"album -1", "albm#6"},
      {"album 7", "error 2: there is no such album"},
      {"document", "error 2: expected the number of an element, found the end of the line"},
      {"last slide of first slideshow", "slid#71"},
      {"every document", "{docu#1, docu#2}"},
      {"count albums", "6"},
      {"count of every album", "6"},
      {"the name of every document", "{\"Clip 1\", \"Clip 2\"}"},
      {"name of current album", "\"Album 3\""},
      {"current album's name", "\"Album 3\""},
      {"tell front document to its name", "\"Clip 1\""},
      {"it", "capp#0"},
      {"it is application \"Keyhouse\"", "false"},
      {"the current album is album 3", "true"},
      {"item 3 of {album 1, album 2, \"x\"} is the current album", "false"},
      {"set d to last document\nset rate of d to 3\nrate of d", "3.0 | rate of docu#2 = 3.0"},
      {"set rate of every document to 2", "2 | rate of docu#1 = 2.0; rate of docu#2 = 2.0"},
      {"rate of 5", "error 2: an integer has no property 'rate' here"},
      {"rate", "error 2: an object has no property 'rate' here"},
      {"set rate to 5", "error 2: an object has no property 'rate' here"},
      {"set rate of 5 to 1", "error 2: an integer has no property 'rate' here"},
      {"tell application \"Keyhouse\" to output muted",
       "error 2: an object has no property 'output muted' here"},
      {"front document's if", "error 2: expected a property or an element, found 'if'"},
      {"document 1 of album 1", "error 2: there is no such document"},
      {"document 1 of {1}", "error 2: a list has no elements of the class 'document'"},
      {"item 1 of front document", "error 2: an object has no elements of the class 'item'"},
      {"launch 5", "error 2: cannot start an integer"},
      {"tell {1} to play", "error 2: cannot tell a list anything"},
  });
}

TEST(Objects, WordsAreTakenByPositionAndLength) {
  expectAll({
      {"player state is playing", "true"},
      {"player state is not playing", "false"},
      {"player state = paused", "false"},
      {"{player state is sound volume, front document is sound volume}", "{false, false}"},
      {"playing", "'kPSP'"},
      {"set d to front document\nset rate of d to 0\nd is playing", "true | rate of docu#1 = 0.0"},
      {"tell front document to it is name", "false"},
      {"set player state to playing", "'kPSP' | stat of capp#0 = 'kPSP'"},
      {"set player state to sound volume", "error 2: cannot make an integer into a constant"},
      {"set player state to playing of front document", "error 2: cannot make a boolean into a constant"},
      {"set sound volume to sound volume - 2", "48 | vol  of capp#0 = 48"},
      {"set sound volume to -2.9", "-2.9 | vol  of capp#0 = -2"},
      {"set name of document 1 to 5", "5 | pnam of docu#1 = \"5\""},
      {"set name of document 1 to true", "error 2: cannot make a boolean into a text"},
      {"set rate of document 1 to \"a\"", "error 2: cannot make a text into a real"},
      {"set frozen to 5", "error 2: cannot make an integer into a boolean"},
      {"set current album to 5", "error 2: cannot make an integer into an object"},
      {"set current album to album 2", "albm#2 | cura of capp#0 = albm#2"},
      {"set sound volume to true", "error 2: cannot make a boolean into an integer"},
      {"if frozen then\nset frozen to false\nelse\nset frozen to true\nend if",
       "true | froz of capp#0 = true"},
      {"tell front document to set frozen to true", "true | froz of capp#0 = true"},
      {"chapter - 1", "0"},
      {"chapter 2", "error 2: there is no such chapter"},
      {"play count", "9"},
      {"slideshow running", "true"},
      {"get get rate of front document", "1.0"},
      {"show last slide of first slideshow", "none | show in capp#0: slid#71"},
      {"show next slide", "none | next in capp#0"},
      {"tell front document to show remote hud", "none | hud  in docu#1"},
      {"go to main menu", "none | menu in capp#0"},
      {"fast forward now", "error 2: expected the end of the line, found 'now'"},
      {"select album (count of {1, 2})", "none | slct in capp#0: albm#2"},
      {"play", "none | play in capp#0"},
      {"play frontMovie", "error 2: the variable 'frontMovie' is not set"},
      {"tell application \"Keyhouse\" to key code 53 using command down",
       "none | keyc in capp#0: 53 usng='cmdd'"},
      {"tell application \"Keyhouse\" to key code 48 using {command down, shift down}",
       "none | keyc in capp#0: 48 usng={'cmdd', 'shfd'}"},
      {"tell application \"Keyhouse\" to key code 48 using 5",
       "error 2: cannot make an integer into a constant"},
      {"tell application \"Keyhouse\"\ntell process id \"abc\"\nkey code 53\nend\nend",
       "none | keyc in prcs#3: 53"},
      {"tell application \"Keyhouse\" to fast forward",
       "error 2: expected the end of the line, found 'forward'"},
      {"output muted of (get get volume settings)", "true | gvol in capp#0"},
      {"set volume 30 without output muted", "none | svol in capp#0: 30 mute=false"},
      {"set volume output volume 30.0 with output muted", "none | svol in capp#0 mute=true ouvl=30"},
      {"set volume with output muted, output volume",
       "error 2: expected a parameter that is true or false, found 'output'"},
  });
  EXPECT_EQ(runScript("output volume of (get volume settings)"), "40 | gvol in capp#0");
  EXPECT_EQ(runScript("(get volume settings) is (get volume settings)"),
            "true | gvol in capp#0; gvol in capp#0");
  EXPECT_EQ(runScript("get volume settings"), "record | gvol in capp#0");
  EXPECT_EQ(runScript("(get volume settings output volume 5)"), "error 1: expected ')', found 'output'");
  EXPECT_EQ(runScript(tell("sound volume of (get volume settings)")), "7 | gvol in capp#0");
  EXPECT_EQ(runScript("name of (get volume settings)"), "error 1: expected the end of the line, found 'of'");
}

TEST(Objects, RecordsAndListsMayDifferOrBeMissing) {
  FakeWorld world;
  const auto record = [](Code field) {
    const Value forty = std::int64_t{40};
    return std::make_shared<const std::map<Code, Value>>(
        std::map<Code, Value>{{field, forty}, {code("ouvl"), forty}, {code("vol "), forty}});
  };
  world.player.replies = {{code("play"), record(code("mute"))},
                          {code("paus"), record(code("zzzz"))},
                          {code("ffwd"), Record()},
                          {code("menu"), List()}};
  EXPECT_EQ(runScript(world, tell("set a to get volume settings\nset b to (play)\nset c to (pause)\n"
                                  "set d to (fast forward)\nset e to (go to main menu)\n"
                                  "{a is b, b is c, a is d, d is a, d is d, count of e}")),
            "{false, false, false, false, true, 0} | "
            "gvol in capp#0; play in capp#0; paus in capp#0; ffwd in capp#0; menu in capp#0");
  EXPECT_EQ(runScript(tell("name of (get volume settings)")),
            "error 2: a record has no property 'name' here | gvol in capp#0");
  world.log.clear();
  EXPECT_EQ(runScript(world, tell("name of (fast forward)")),
            "error 2: a record has no property 'name' here | ffwd in capp#0");
}

TEST(Objects, ApplicationsThatDoNotRun) {
  const auto whenQuit = [](const std::string& body) {
    FakeWorld world;
    world.player.runs = false;
    return runScript(world, tell(body));
  };
  EXPECT_EQ(whenQuit("play"), "error 2: the application is not running");
  EXPECT_EQ(whenQuit("frozen"), "error 2: the application is not running");
  EXPECT_EQ(whenQuit("count documents"), "error 2: the application is not running");
  EXPECT_EQ(whenQuit("launch\nplay"), "none | launch; play in capp#0");
  EXPECT_EQ(whenQuit("activate\nfrozen"), "false | activate");
  EXPECT_EQ(whenQuit("tell application \"Keyhouse\" to activate application \"com.tarn.player\""),
            "none | activate");
  EXPECT_EQ(whenQuit("ignoring application responses\nfrozen\nplay\nend ignoring\n5"), "5");
}

TEST(Objects, RefusalsEndTheScriptUnlessIgnored) {
  const auto whenRefused = [](const std::string& body) {
    FakeWorld world;
    world.player.refused.insert(code("paus"));
    world.player.hangs = true;
    return runScript(world, tell(body));
  };
  EXPECT_EQ(whenRefused("play\npause\nplay"), "error 3: refused | stall; play in capp#0; stall");
  EXPECT_EQ(whenRefused("ignoring application responses\nplay\npause\nplay document 9\nset x to play\n"
                        "if rate of document 9 is 1 then play\nplay front document\nend ignoring"),
            "none | play in capp#0; play in capp#0; play in capp#0: docu#1");
  EXPECT_EQ(whenRefused("ignoring application responses\n1 div 0\nend"), "error 3: division by zero");
  EXPECT_EQ(whenRefused("ignoring application responses\nend\nplay"), "none | stall; play in capp#0");
  EXPECT_EQ(whenRefused("set x to play"), "error 2: there is no value here | stall; play in capp#0");
}

}  // namespace
}  // namespace tarnscript
