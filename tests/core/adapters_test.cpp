// Every button in every mode of every application: what the application gets, and what the adapter answers.
//
// In the tables an entry reads "what was sent; more; +": the names of script_texts.h without the code of the
// application itself, + for handled and - for not. "silence" is what another application gets that runs
// beside it. A button that no row names is not handled, and costs the mode's queries alone.

#include <gtest/gtest.h>

#include <map>
#include <sstream>

#include "adapters/lumbra.h"
#include "adapters/lyrabox.h"
#include "adapters/slidewell.h"
#include "adapters/snapvale.h"
#include "adapters/spindle.h"
#include "adapters/vistremeplayer.h"
#include "adapters/vistremeplayerx.h"
#include "registry/registry.h"
#include "tests/core/rehearsal.h"
#include "tests/core/script_texts.h"

namespace {

// clang-format off
const std::map<std::string, UsageKey> kButtons = {
    {"Undefined", 0}, {"AppMenu", 0x00010086}, {"Desktop87", 0x00010087}, {"Desktop88", 0x00010088},
    {"Select", 0x00010089}, {"Right", 0x0001008A}, {"Left", 0x0001008B}, {"Up", 0x0001008C},
    {"Down", 0x0001008D}, {"Menu", 0x000C0040}, {"Pick", 0x000C0041}, {"MenuUp", 0x000C0042},
    {"MenuDown", 0x000C0043}, {"MenuLeft", 0x000C0044}, {"MenuRight", 0x000C0045}, {"Play", 0x000C00B0},
    {"Pause", 0x000C00B1},
    {"Record", 0x000C00B2}, {"Forward", 0x000C00B3}, {"Rewind", 0x000C00B4}, {"Next", 0x000C00B5},
    {"Previous", 0x000C00B6}, {"Stop", 0x000C00B7}, {"PlayPause", 0x000C00CD}, {"VolumeUp", 0x000C00E9},
    {"VolumeDown", 0x000C00EA}, {"Stranger", 0xFFFFFFFF}};
// clang-format on

struct Adapter {
  std::string code;
  bool (*handle)(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);
  std::string start;                               ///< commands that start it and the one to be silenced
  std::string silenced = "Slid:stop slideshow; ";  ///< what that one gets
};

bool throughDispatch(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value) {
  return dispatchToSpindle(PackedHIDEvent{usage} << 16 | usagePage, value);
}

const Adapter kLyra = {"Lyra", LyraboxHandleHIDEvent, "open lyrabox; open slidewell; "};
const Adapter kSpin = {"Spin", SpindleHandleHIDEvent, "open spindle; open slidewell; "};
const Adapter kDispatch = {"Spin", throughDispatch, kSpin.start};
const Adapter kVist = {"Vist", VistremePlayerHandleHIDEvent,
                       "open slidewell; open com.tarn.vistremeplayer; "
                       "tell com.tarn.vistremeplayer to set current time of front movie to 60; "};
const Adapter kVstX = {"VstX", VistremePlayerXHandleHIDEvent,
                       "open slidewell; open VistremePlayerX; "
                       "tell VistremePlayerX to set current time of front document to 60; "};
const Adapter kSlid = {"Slid", SlidewellHandleHIDEvent, "open slidewell; open lyrabox; ",
                       "Lyra:pause if playing; "};
const Adapter kSnap = {"Snap", SnapvaleHandleHIDEvent, "open snapvale; open slidewell; "};
const Adapter kLumb = {"Lumb", LumbraHandleHIDEvent, "open lumbra; open slidewell; "};

/// What comes of steps: "Play 1" is a button and its value, all else a command of the desktop.
std::string played(const Adapter& adapter, const std::string& setUp, const std::vector<std::string>& steps) {
  const std::string all = inChild([&] {
    set(adapter.start + setUp);
    refreshCachedASNs();
    gKVDConnection = HostConnectWindowServer();
    sent();
    std::string text;
    for (const std::string& step : steps) {
      const auto button = kButtons.find(step.substr(0, step.find(' ')));
      if (button == kButtons.end()) {
        set(step);
        continue;
      }
      const int value = std::stoi(step.substr(step.find(' ')));
      const bool handled = adapter.handle(button->second >> 16, button->second & 0xFFFF, value);
      text += sent() + (handled ? "+; " : "-; ");
    }
    return text;
  });
  std::string text = named(all);
  for (const auto& [from, to] : {std::pair(adapter.silenced, std::string("silence; ")),
                                 std::pair(adapter.code + ":", std::string())}) {
    for (std::size_t at; (at = text.find(from)) != std::string::npos;) text.replace(at, from.size(), to);
  }
  return text;
}

/// Buttons with what comes of a press, a release and a press by a value below zero.
struct Row {
  std::string buttons;
  std::string pressed;
  std::string released = pressed;
  std::string negative = pressed;
};
using Rows = std::vector<Row>;

Rows operator+(Rows rows, const Rows& more) {
  rows.insert(rows.end(), more.begin(), more.end());
  return rows;
}

/// Tries every button with the values of each mode that these commands set up; the rows name `count` buttons.
void expectModes(const Adapter& adapter, const std::vector<std::string>& setUps, const std::string& queries,
                 std::size_t count, const Rows& rows) {
  std::map<std::string, Row> expected;
  for (const Row& row : rows) {
    std::istringstream buttons(row.buttons);
    for (std::string button; buttons >> button;) {
      EXPECT_TRUE(kButtons.contains(button)) << button;
      EXPECT_TRUE(expected.emplace(button, row).second) << button << " twice";
    }
  }
  EXPECT_EQ(expected.size(), count);
  // What sends nothing changes nothing either and needs no child of its own.
  std::vector<std::string> quiet;
  std::string quietly;
  std::map<std::string, std::string> loud;
  for (const auto& [button, key] : kButtons) {
    const Row row = expected.contains(button) ? expected[button] : Row{button, "-"};
    for (const auto& [value, text] :
         {std::pair(" 1", row.pressed), std::pair(" 0", row.released), std::pair(" -1", row.negative)}) {
      if (text.size() > 1) {
        loud[button + value] = queries + text + "; ";
      } else {
        quiet.push_back(button + value);
        quietly += queries + text + "; ";
      }
    }
  }
  for (const std::string& setUp : setUps) {
    SCOPED_TRACE(adapter.code + " " + setUp);
    EXPECT_EQ(played(adapter, setUp, quiet), quietly);
    for (const auto& [step, result] : loud) EXPECT_EQ(played(adapter, setUp, {step}), result) << step;
  }
}

/// Both halves of a key that is posted.
std::string key(const std::string& application, int code) {
  const std::string name = "key " + std::to_string(code);
  return name + " pressed in " + application + "; " + name + " released in " + application + "; ";
}

// clang-format off

TEST(Buttons, OfTheJukebox) {
  expectModes(kLyra, {"", "tell lyrabox to play", "answers lyrabox errors"}, "", 14, {
      {"Select Play PlayPause", "silence; playpause; +"}, {"Right MenuRight Next", "next track; +"},
      {"Left MenuLeft Previous", "back track; +"}, {"Pick", "silence; event 'hook'/'RSel' to Lyrabox; +"},
      {"Pause", "pause if playing; +"}, {"Forward", "fast forward; +", "resume; +", "fast forward; +"},
      {"Rewind", "rewind; +", "resume; +", "rewind; +"}, {"Stop", "stop; +"}});
}

const Rows kDiscAlways = {
    {"MenuUp", "press up arrow key; +"}, {"MenuDown", "press down arrow key; +"},
    {"MenuLeft", "press left arrow key; +"}, {"MenuRight", "press right arrow key; +"},
    {"Play", "silence; play or pause; +"}, {"Pause", "pause dvd; +"}, {"Stop", "stop dvd; +"},
    {"Next", "chapter next; +"}, {"Previous", "chapter back; +"}};
const Rows kDiscInside = {{"Up", "press up arrow key; +"}, {"Down", "press down arrow key; +"}};
const Rows kDiscFilm = {
    {"Select", "menu?; silence; play or pause; +"}, {"PlayPause", "menu?; silence; play or pause; +"},
    {"Right", "menu?; chapter next; +"}, {"Left", "menu?; chapter back; +"}, {"Pick", "menu?; +"},
    {"Forward", "menu?; state?; scan forward; +", "menu?; play dvd; +"},
    {"Rewind", "menu?; state?; scan back; +", "menu?; play dvd; +"}};
const Rows kDiscMainMenu = {{"AppMenu", "silence; menu?; state?; go to main menu; +"}};
const Rows kDiscBeginning = {{"AppMenu", "silence; menu?; state?; go to beginning of disc; +"}};
const Rows kDiscMenu = {
    {"AppMenu", "silence; menu?; go return to dvd; +"},
    {"Select Pick", "menu?; silence; press enter key; +"}, {"PlayPause", "menu?; +"},
    {"Right", "menu?; press right arrow key; +"}, {"Left", "menu?; press left arrow key; +"},
    {"Forward", "menu?; fast forward dvd; +", "menu?; +"}, {"Rewind", "menu?; rewind dvd; +", "menu?; +"}};
const std::string kUnmute = "set audio muted to false; ";
const std::string kSoundUp = "volume?; sound key up pressed; +";
const std::string kUpFreed = "volume?; sound key up released; +";
const std::string kSoundDown = "volume?; sound key down pressed; +";
const std::string kDownFreed = "volume?; sound key down released; +";
const Rows kDiscVolume = {
    {"VolumeUp", kUnmute + kSoundUp, kUpFreed}, {"VolumeDown", kUnmute + kSoundDown, kDownFreed}};
const Rows kDiscFilmVolume = {
    {"Up", "menu?; " + kUnmute + kSoundUp, "menu?; " + kUpFreed},
    {"Down", "menu?; " + kUnmute + kSoundDown, "menu?; " + kDownFreed}};
const Rows kDiscMenuArrows = {
    {"Up", "menu?; press up arrow key; +", "menu?; +"},
    {"Down", "menu?; press down arrow key; +", "menu?; +"}};
const std::string kPlaysDisc = "tell spindle to play dvd";
const std::string kPausesDisc = kPlaysDisc + "; tell spindle to pause dvd";
const std::string kShowsMenu = "tell spindle to go to main menu";

TEST(Buttons, OfTheDiscPlayer) {
  expectModes(kSpin, {"", kPlaysDisc, kPausesDisc}, "", 19,
              kDiscAlways + kDiscInside + kDiscFilm + kDiscMainMenu);
  expectModes(kSpin, {"disc out", "answers spindle errors"}, "", 19,
              kDiscAlways + kDiscInside + kDiscFilm + kDiscBeginning);
  expectModes(kSpin, {kShowsMenu}, "", 19, kDiscAlways + kDiscInside + kDiscMenu);
  expectModes(kDispatch, {"", kPlaysDisc, kPausesDisc}, "", 21,
              kDiscAlways + kDiscFilm + kDiscMainMenu + kDiscVolume + kDiscFilmVolume);
  expectModes(kDispatch, {kShowsMenu}, "", 21, kDiscAlways + kDiscMenu + kDiscVolume + kDiscMenuArrows);
}

TEST(Buttons, OfTheClassicMoviePlayer) {
  const std::string app = "tell com.tarn.vistremeplayer to ";
  expectModes(kVist, {"", app + "play front movie", app + "set rate of front movie to -2"}, "", 12, {
      {"Select Play PlayPause", "silence; play or pause; +"}, {"Right Next", "step forward front movie; +"},
      {"Left Previous", "step backward front movie; +"}, {"Pick", "+"}, {"Pause", "pause front movie; +"},
      {"Stop", "stop front movie; +"},
      {"Forward", "playing?; set rate of front movie to 2.0; +", "set rate of front movie to 0.0; +"},
      {"Rewind", "playing?; set rate of front movie to -2.0; +", "set rate of front movie to 0.0; +"}});
}

const std::string kRate = "tell VistremePlayerX to set rate of front document to ";
const Rows kMovieAlways = {
    {"Right", "forward ladder; -"}, {"Left", "backward ladder; -"}, {"Pick", "+"},
    {"Stop", "stop front document; +"}, {"Pause", "hud pause; playing?; +"}, {"Next", "hud step forward; +"}};
const Rows kMovieSlow = {
    {"Select Play PlayPause", "silence; rate?; play or pause; +"},
    {"Forward", "rate?; playing?; rate 2; +", "rate?; +"},
    {"Rewind", "rate?; playing?; rate -2; +", "rate?; +"}};
const Rows kMovieScans = {
    {"Select Play PlayPause", "silence; rate?; hud pause; playing?; +"},
    {"Forward", "rate?; forward ladder; +", "rate?; +"}, {"Rewind", "rate?; backward ladder; +", "rate?; +"}};
const Rows kMovieStands = {{"Previous", "playing?; hud step back; +"}};
const Rows kMoviePlays = {{"Previous", "playing?; hud step back; hud play; playing?; +"}};

TEST(Buttons, OfTheModernMoviePlayer) {
  expectModes(kVstX, {"", "answers VistremePlayerX errors"}, "", 12,
              kMovieAlways + kMovieSlow + kMovieStands);
  // A rate counts without its fraction.
  expectModes(kVstX, {kRate + "1", kRate + "1.5", kRate + "-0.5"}, "", 12,
              kMovieAlways + kMovieSlow + kMoviePlays);
  expectModes(kVstX, {kRate + "2", kRate + "8", kRate + "-1", kRate + "-8"}, "", 12,
              kMovieAlways + kMovieScans + kMoviePlays);
}

TEST(Buttons, OfThePresentation) {
  const std::string plays = "tell slidewell to start slideshow";
  expectModes(kSlid, {plays + "; tell slidewell to show slide switcher"}, "switcher?; ", 13, {
      {"AppMenu", "cancel slide switcher; +"}, {"Select Pick Play PlayPause", "accept slide switcher; +"},
      {"Right MenuRight Next", "move slide switcher forward; +"},
      {"Left MenuLeft Previous", "move slide switcher backward; +"}, {"Menu Stop", "stop slideshow; +"}});
  expectModes(kSlid, {plays}, "switcher?; playing?; ", 15, {
      {"AppMenu", "show slide switcher; +"}, {"Select PlayPause", "freeze; +"},
      {"Right Pick MenuRight Play Next", "show next slide; +"},
      {"Left MenuLeft Previous", "show previous slide; +"}, {"Menu Stop", "stop slideshow; +"},
      {"Forward", "show last slide of first slideshow; +", "+", "+"},
      {"Rewind", "show first slide of first slideshow; +", "+", "+"}});
  expectModes(kSlid, {"", plays + "; answers slidewell nothing"}, "switcher?; playing?; ", 4, {
      {"Select Play PlayPause", "silence; start slideshow; +"}, {"Pick", "+"}});
}

const Rows kPhotosAlways = {{"Pick Forward Rewind", "+"}};
const Rows kOldPhotos = {
    {"Select Play Pause PlayPause Menu Stop", "silence; start, not waiting; +"}, {"AppMenu", "-"}};
const Rows kAlbums6 = {{"Right MenuRight Next", "next 6; +"}, {"Left MenuLeft Previous", "previous 6; +"}};
const Rows kAlbums7 = {{"Right MenuRight Next", "next 7; +"}, {"Left MenuLeft Previous", "previous 7; +"}};
const Rows kAlbums8 = {{"Right MenuRight Next", "next 8; +"}, {"Left MenuLeft Previous", "previous 8; +"}};
const Rows kShownPhotos = {
    {"Right MenuRight Next", key("Snapvale", 124) + "+"},
    {"Left MenuLeft Previous", key("Snapvale", 123) + "+"}};
const Rows kOldShow = {
    {"Select Play Pause PlayPause", key("Snapvale", 49) + "+"}, {"Menu Stop", key("Snapvale", 36) + "+"},
    {"AppMenu", "+"}};
const Rows kNewShow = {
    {"Select Play Pause PlayPause", key("Snapvale", 49) + "+"}, {"Menu Stop", key("Snapvale", 53) + "+"},
    {"AppMenu", "+"}};

TEST(Buttons, OfTheConsumerPhotoLibraryBeforeVersion8) {
  const std::string none = "version snapvale none", six = "version snapvale 6.0.6";
  const std::string seven = "version snapvale 7.1", captured = "; capture 1 on";
  expectModes(kSnap, {none, six, "close snapvale"}, "", 16, kPhotosAlways + kOldPhotos + kAlbums6);
  expectModes(kSnap, {seven}, "", 16, kPhotosAlways + kOldPhotos + kAlbums7);
  expectModes(kSnap, {none + captured, six + captured, seven + captured}, "", 16,
              kPhotosAlways + kShownPhotos + kOldShow);
}

TEST(Buttons, OfTheConsumerPhotoLibrarySinceVersion8) {
  const std::string runs = "tell snapvale to start slideshow; ", captured = "capture 1 on";
  expectModes(kSnap, {"", "version snapvale 9.2"}, "slideshow?; ", 16, kPhotosAlways + kAlbums8 + Rows{
      {"Select Play Pause PlayPause", "silence; start; +"}, {"Menu Stop", "silence; +"},
      {"AppMenu", "command-escape; +"}});
  expectModes(kSnap, {runs}, "slideshow?; ", 16, kPhotosAlways + kShownPhotos + Rows{
      {"Select Play Pause PlayPause", "silence; space; +"}, {"Menu Stop", "silence; escape; +"},
      {"AppMenu", "-"}});
  expectModes(kSnap, {captured}, "slideshow?; ", 16, kPhotosAlways + kAlbums8 + kNewShow);
  expectModes(kSnap, {runs + captured}, "slideshow?; ", 16, kPhotosAlways + kShownPhotos + kNewShow);
}

TEST(Buttons, OfTheProfessionalPhotoApplication) {
  const auto post = [](int code) { return key("Lumbra", code) + "+"; };
  const Rows always = {{"Undefined AppMenu Pick", "+"},
                       {"Right Forward", post(124), "+"}, {"Left Rewind", post(123), "+"}};
  expectModes(kLumb, {""}, "", 13, always + Rows{
      {"Select PlayPause", "silence; key 56 pressed in Lumbra; " + key("Lumbra", 1) +
                           "key 56 released in Lumbra; " + post(36)},
      {"Up", post(126), "-"}, {"Down", post(125), "-"}, {"Menu Stop", "+"}});
  expectModes(kLumb, {"capture 1 on"}, "", 13, always + Rows{
      {"Select PlayPause", post(49)}, {"Up Down", "-"}, {"Menu Stop", post(53)}});
}

TEST(Buttons, ScanAndReturnToWhatWasBefore) {
  EXPECT_EQ(played(kSpin, kPlaysDisc, {"Forward 1", "Forward 0"}),
            "menu?; state?; scan forward; +; menu?; play dvd; +; ");
  EXPECT_EQ(played(kSpin, kPausesDisc, {"Rewind 1", "Rewind 0", "Forward 0"}),
            "menu?; state?; scan back; +; menu?; pause dvd; +; menu?; pause dvd; +; ");
  EXPECT_EQ(played(kSpin, kPausesDisc, {"Forward -1", kShowsMenu, "Forward 1", "Rewind 0",
                                        "tell spindle to go return to dvd", "Forward 0"}),
            "menu?; state?; scan forward; +; menu?; fast forward dvd; +; menu?; +; menu?; pause dvd; +; ");
  EXPECT_EQ(played(kVist, "tell com.tarn.vistremeplayer to play front movie",
                   {"Forward 1", "Rewind 0", "Forward 0", "Pause 1", "Rewind 1", "Forward 0"}),
            "playing?; set rate of front movie to 2.0; +; set rate of front movie to 1.0; +; "
            "set rate of front movie to 1.0; +; "
            "pause front movie; +; "
            "playing?; set rate of front movie to -2.0; +; set rate of front movie to 0.0; +; ");
  EXPECT_EQ(played(kVstX, kRate + "1", {"Forward 1", "Forward 0", "Forward 1", "Rewind 1", "PlayPause 1"}),
            "rate?; playing?; rate 2; +; rate?; +; rate?; forward ladder; +; rate?; backward ladder; +; "
            "silence; rate?; hud play; playing?; +; ");
  EXPECT_EQ(played(kVstX, "", {"Rewind 1", "Play 1"}),
            "rate?; playing?; rate -2; +; silence; rate?; hud pause; playing?; +; ");
  // A step back remembers play too; pausing forgets it.
  EXPECT_EQ(played(kVstX, kRate + "1",
                   {"Previous 1", kRate + "4", "Select 1", "Pause 1", kRate + "4", "Select 1"}),
            "playing?; hud step back; hud play; playing?; +; silence; rate?; hud play; playing?; +; "
            "hud pause; playing?; +; silence; rate?; hud pause; playing?; +; ");
}

// clang-format on

}  // namespace
