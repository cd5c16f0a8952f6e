// Nothing that can be written may crash the engine, hang it or exhaust memory.
#include <gtest/gtest.h>

#include <random>

#include "platform/tarnscript/limits.h"
#include "tests/tarnscript/fakes.h"

namespace tarnscript {
namespace {

std::string times(std::size_t count, std::string_view text) {
  std::string all;
  for (std::size_t i = 0; i < count; ++i) all += text;
  return all;
}

TEST(Limits, SourceSize) {
  EXPECT_EQ(runScript(std::string(kMaxSourceSize - 1, ' ') + "7"), "7");
  EXPECT_EQ(runScript(std::string(kMaxSourceSize, ' ') + "7"), "error 1: the script is too long");
  EXPECT_EQ(runScript(std::string(1 << 20, '(')), "error 1: the script is too long");
}

TEST(Limits, Nesting) {
  const std::size_t deepest = kMaxNesting - 2;  // the statement and the innermost value take a level each
  EXPECT_EQ(runScript(times(deepest, "(") + "7" + times(deepest, ")")), "7");
  EXPECT_EQ(runScript(times(deepest, "if true then ") + "7"), "7");
  EXPECT_EQ(runScript(times(kMaxNesting - 1, "1+") + "1"), std::to_string(kMaxNesting));
  const std::string open = "tell application \"com.tarn.Player\" to ";
  for (const std::string& source :
       {times(1000, "(") + "7", times(1000, "{"), times(1000, "- "), times(1000, "not "),
        times(1000, "1+") + "1", times(1000, "if true then "), times(1000, "repeat\n"),
        open + times(1000, "name of "), open + times(1000, "album ("), open + times(1000, "play get play "),
        "x" + times(1000, "'s item 1"), "{" + times(1000, "(1) & {") + times(1000, "}") + "}"}) {
    EXPECT_NE(runScript(source).find("nested too deeply"), std::string::npos) << source.substr(0, 60);
  }
  // Neither the lists nor the chains are too deep by themselves.
  EXPECT_EQ(runScript(times(20, "{") + "1" + times(20, times(20, "&1") + "}")),
            "error 1: the expression is nested too deeply");
  EXPECT_EQ(runScript("if false then\n" + times(2000, "else if false then\n") + "else\n7\nend if"), "7");
  EXPECT_EQ(runScript(times(2000, "get ") + "7"), "7");
}

TEST(Limits, Work) {
  const std::string longText = "set t to \"0123456789\"\nrepeat 12 times\nset t to t & t\nend\n";
  const std::initializer_list<std::string> sources = {
      "repeat\nend",
      "repeat 9223372036854775807 times\nend",
      "repeat with i from 1 to 9223372036854775807\nend",
      longText + "repeat\nset u to t & \"x\"\nend",
      "set x to {1}\nrepeat 30 times\nset x to {x, x}\nend\nx",
  };
  for (const std::string& source : sources) {
    EXPECT_NE(runScript(source).find("the script does too much"), std::string::npos) << source;
  }
}

TEST(Limits, ListsAndTexts) {
  const std::string doubling = "repeat 20 times\nset x to x & x\nend";
  EXPECT_EQ(runScript("set x to {1}\n" + doubling), "error 3: a list is too long");
  EXPECT_EQ(runScript("set x to \"1\"\n" + doubling), "error 3: a text is too long");
  EXPECT_EQ(runScript("set x to {1}\nrepeat 14 times\nset x to x & x\nend\ncount x"),
            std::to_string(kMaxListLength));
  const std::string wrap = "set x to 1\nrepeat " + std::to_string(kMaxListDepth);
  EXPECT_EQ(runScript(wrap + " times\nset x to {x}\nend\ncount x"), "1");
  EXPECT_EQ(runScript(wrap + " + 1 times\nset x to {x}\nend"), "error 3: lists are nested too deeply");
}

TEST(Limits, BrokenTextsAreAnswered) {
  const std::string whole =
      "tell application id\"com.tarn.Player\"\nset theAlbums to the id of every album\nset n to -1\n"
      "repeat with i from 1 to count theAlbums\nif the id of current album is item i of theAlbums then\n"
      "set n to i\nend if\nend repeat\nif the current album is album 1\nselect album (count theAlbums)\n"
      "else if n >= the (count of theAlbums) then\nplay front document's name & \"\\\"x\u00e9\"\nelse\n"
      "tell application \"Keyhouse\"\ntell process id \"com.tarn.Player\"\nkey code 53 using command down\n"
      "end tell\nend tell\nend if\nignoring application responses\nset volume without output muted\n"
      "end ignoring\nif output volume of (get volume settings) \u2265 1.5e1 then set rate of last document to"
      " -2.0 / 3\nend tell";
  const auto answer = [](const std::string& source) {
    FakeWorld world;
    Error error;
    const auto script = Script::compile(source, world, error);
    if (script == nullptr) {
      EXPECT_GE(error.line, 1);
      EXPECT_FALSE(error.message.empty());
    } else if (const Outcome outcome = script->run(world); outcome.error) {
      EXPECT_GE(outcome.error->line, 1);
    }
    return script != nullptr;
  };
  ASSERT_TRUE(answer(whole));
  for (std::size_t length = 0; length < whole.size(); ++length) answer(whole.substr(0, length));

  std::mt19937 random(20240229);  // a fixed seed: the same texts at every run
  const auto below = [&random](std::size_t bound) { return random() % bound; };
  int compiled = 0;
  for (int round = 0; round < 3000; ++round) {
    std::string source = whole;
    for (std::size_t changes = 1 + below(4); changes > 0; --changes) {
      const std::size_t at = below(source.size());
      const std::string piece = whole.substr(below(whole.size()), below(20));
      switch (below(3)) {
        case 0:
          source[at] = static_cast<char>(below(256));
          break;
        case 1:
          source.erase(at, below(20));
          break;
        default:
          source.insert(at, piece);
          break;
      }
    }
    compiled += answer(source) ? 1 : 0;
  }
  EXPECT_GT(compiled, 50);
}

}  // namespace
}  // namespace tarnscript
