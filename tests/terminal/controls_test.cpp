#include "platform/terminal/controls.h"

#include <clocale>
#include <cstdlib>

#include <gtest/gtest.h>

#include "platform/stage/director.h"

namespace {

using terminal::Special;

class Controls : public testing::Test {
 protected:
  void SetUp() override {
    std::setlocale(LC_CTYPE, "C.UTF-8");
    setenv("XDG_RUNTIME_DIR", "/nonexistent", 1);
    stage::useVirtualTime();
    stage::setUpDesktop();
  }

  void type(std::wstring_view text) {
    for (const wchar_t character : text) terminal::handle(state_, {character, Special::None});
  }
  void press(Special key) { terminal::handle(state_, {0, key}); }

  /// The commands that the keys stood for.
  std::wstring commands() {
    std::wstring all;
    int back = 0;
    for (const terminal::Line& line : state_.journal.show(100, 200, back, false)) {
      if (line.tone == terminal::Tone::Command) all += line.text.substr(2) + L"; ";
    }
    return all;
  }

  terminal::State state_;
};

TEST_F(Controls, DigitsOpenBringToTheFrontAndClose) {
  type(L"2208x2x8");
  EXPECT_EQ(commands(), L"open Spindle; front Spindle; front nobody; close Spindle; ");
  stage::performCommand("open com.example.Editor");
  stage::performCommand("open com.other.Editor");
  type(L"9x9");
  EXPECT_TRUE(commands().ends_with(L"front com.other.Editor; close com.other.Editor; "))
      << "the name is the first's";
}

TEST_F(Controls, KeysTapButtonsAndHoldThoseThatAreHeld) {
  type(L" n.m");
  press(Special::Left);
  press(Special::Escape);
  EXPECT_EQ(commands(), L"tap playpause; tap next; tap stop; tap app-menu; tap left; tap menu; ");
  type(L"ff");
  EXPECT_EQ(state_.held, nullptr);
  type(L"+p-r");
  EXPECT_EQ(state_.held->button, "rewind");
  EXPECT_TRUE(commands().ends_with(
      L"press forward; release forward; press volume-up; release volume-up; tap previous; press volume-down; "
      L"release volume-down; press rewind; "));
}

TEST_F(Controls, KeysMakeThingsHarder) {
  type(L"e1e1e1e9ccvvvl");
  EXPECT_EQ(
      commands(),
      L"answers Lyrabox errors; answers Lyrabox nothing; answers Lyrabox normally; capture 1 on; "
      L"capture 1 off; version Snapvale 6.0.6; version Snapvale 7.1.5; version Snapvale 8.1.2; lock on; ");
}

TEST_F(Controls, TheCommandLineTakesEveryCharacterAsText) {
  type(L":volume 7q");
  press(Special::Backspace);
  press(Special::Enter);
  EXPECT_EQ(stage::desktop().outputVolume, 7);
  type(L":mute on");
  press(Special::Escape);
  EXPECT_FALSE(stage::desktop().outputMuted);
  type(L":");
  press(Special::Up);
  press(Special::Up);
  EXPECT_EQ(state_.commandLine, L"volume 7");
  press(Special::Down);
  EXPECT_EQ(state_.commandLine, L"");
  press(Special::Up);
  for (int i = 0; i < 9; ++i) press(Special::Backspace);
  EXPECT_FALSE(state_.commandLine.has_value());
  type(L":");
  press(Special::Enter);
  EXPECT_EQ(commands(), L"volume 7; ");
}

}  // namespace
