// What each script does to the application that it speaks to; and the commands and questions of no button.

#include <gtest/gtest.h>

#include <regex>
#include <set>

#include "adapters/lyrabox.h"
#include "adapters/slidewell.h"
#include "adapters/snapvale.h"
#include "adapters/spindle.h"
#include "adapters/vistremeplayer.h"
#include "adapters/vistremeplayerx.h"
#include "platform/stage/clock.h"
#include "platform/stage/script_world.h"
#include "registry/bridge.h"
#include "registry/registry.h"
#include "tests/core/rehearsal.h"
#include "tests/core/script_texts.h"

namespace {

/// What an application does, step by step: "script → what comes of it", scripts by their names without the
/// code, "+3 s" for time that passes, "/…" for a command of the desktop. What comes of a script are changes
/// and the keystroke helper's keys, of a question the answer.
struct Story {
  std::string code;
  std::string start;
  const char* text;
};

const Story kStories[] = {
    {"", "mute on", R"(volume? → 50 | muted? → true | unmute → output no longer muted | muted? → false)"},
    {"Lyra:", "open lyrabox",
     R"(playpause → plays "Harbour Lights" | get player state → 'kPSP' | next track → plays "Paper Boats" |
        +3 s → nothing | fast forward → scans forward through "Paper Boats" | resume → plays "Paper Boats" |
        rewind → scans back through "Paper Boats" | resume → plays "Paper Boats" |
        back track → plays "Harbour Lights" | pause if playing → paused in "Harbour Lights" at 0:00 |
        get player state → 'kPSU' | stop → stopped | pause if playing → nothing | get player state → 'kPSS' |
        volume up → volume 60 → 62 | volume down → volume 62 → 60)"},
    {"Spin:", "open spindle; tell spindle to play dvd",
     R"(+3 s → nothing | chapter back → shows the disc menu, at "Play the film" |
        go return to dvd → plays chapter 1 at 0:03 | +2 s → nothing |
        chapter back → shows the disc menu, at "Play the film" | go return to dvd → plays chapter 1 at 0:05 |
        +1 s → nothing | chapter back → goes to chapter 1 | chapter next → goes to chapter 2 |
        chapter back → goes to chapter 1 | set chapter to 6 → goes to chapter 6 | menu? → false |
        chapter next → shows the disc menu, at "Play the film" | menu? → true | get active dvd menu → 'emma' |
        press down arrow key → menu at "Chapter 4" | press right arrow key → nothing |
        press left arrow key → nothing | press up arrow key → menu at "Play the film" |
        press enter key → plays chapter 1 at 0:00 | play or pause → paused in chapter 1 at 0:00 |
        state? → 'espa' | play or pause → plays chapter 1 at 0:00 | state? → 'espl' | +60 s → nothing |
        set dvd scan rate to x4 → nothing | scan forward → scans forward ×8 from chapter 1 at 1:00 |
        get dvd scan rate → 'xs04' | scan back → scans back ×8 from chapter 1 at 1:00 |
        get dvd scan rate → 'xs04' | fast forward dvd → scans forward ×4 from chapter 1 at 1:00 |
        rewind dvd → scans back ×4 from chapter 1 at 1:00 | pause dvd → paused in chapter 1 at 1:00 |
        play dvd → plays chapter 1 at 1:00 | stop dvd → stopped | state? → 'esps' |
        go to main menu → shows the disc menu, at "Play the film" |
        go to beginning of disc → stopped; goes to chapter 1 |
        play from beginning → goes to chapter 1; plays chapter 1 at 0:00 | get has media → true |
        set displaying subtitle to true → subtitles on | get displaying subtitle → true |
        set displaying subtitle to false → subtitles off |
        set controller visibility to false → controller off |
        set viewer full screen to true → full screen on | set audio muted to true → mute on |
        set audio muted to false → mute off | volume up → volume 192 → 208 |
        set audio volume to 250 → volume 208 → 250 | volume up → volume 250 → 255 | volume up → nothing |
        set audio volume to 10 → volume 255 → 10 | volume down → volume 10 → 0 | volume down → nothing |
        get audio volume → 0 | activate → Spindle comes to the front)"},
    {"Vist:", "open com.tarn.vistremeplayer",
     R"(playing? → false | play or pause → plays | playing? → true | +60 s → nothing |
        set rate of front movie to 2.0 → plays at rate 2 |
        set rate of front movie to -2.0 → plays at rate -2 | set rate of front movie to 1.0 → plays |
        set rate of front movie to 0.0 → stands at 1:00 | step forward front movie → steps forward |
        step backward front movie → steps back | play frontMovie → error | play or pause → plays |
        play or pause → stands at 1:00 | play or pause → plays | pause front movie → stands at 1:00 |
        play or pause → plays | stop front movie → stands at 0:00 |
        set viewer full screen to true → full screen on |
        set sound volume of front movie to 250 → volume 128 → 250 | volume up → volume 250 → 256 |
        volume up → nothing | set sound volume of front movie to 10 → volume 256 → 10 |
        volume down → volume 10 → 0 | volume down → nothing | get sound volume of front movie → 0 |
        activate → VistremePlayer comes to the front)"},
    {"VstX:", "open VistremePlayerX",
     R"(playing? → false | hud play → hud; plays | playing? → true | +60 s → nothing |
        rate 2 → hud; plays at rate 2 | rate -2 → hud; plays at rate -2 | rate? → -2 | rate 1 → hud; plays |
        rate 0 → hud; stands at 1:00 | play or pause → hud; plays | play or pause → hud; stands at 1:00 |
        hud step forward → hud; steps forward | hud step back → hud; steps back | hud play → hud; plays |
        hud pause → hud; stands at 1:00 | hud play → hud; plays | stop front document → stands at 0:00 |
        set audio volume of front document to 0.95 → volume 0.5 → 0.95 | volume up → volume 0.95 → 1 |
        volume up → nothing | volume down → volume 1 → 0.9375 |
        set sound volume of front document to 0.03 → volume 0.9375 → 0.03 | volume down → volume 0.03 → 0 |
        volume down → nothing | volume up → volume 0 → 0.0625 | get audio volume of front document → 0.0625 |
        activate → VistremePlayerX comes to the front)"},
    {"VstX:", "open VistremePlayerX",
     R"(set current time of front document to 60 → goes to 1:00 |
        set rate of front document to -8 → plays at rate -8 | forward ladder → hud; plays at rate -4 |
        forward ladder → hud; plays at rate -2 | forward ladder → hud; plays |
        forward ladder → hud; steps forward | forward ladder → hud; steps forward |
        set rate of front document to 2 → plays at rate 2 | forward ladder → hud; plays at rate 4 |
        forward ladder → hud; plays at rate 8 | forward ladder → hud; plays at rate 2 |
        set rate of front document to 3 → plays at rate 3 | forward ladder → hud; plays at rate 6 |
        set rate of front document to -1 → plays at rate -1 | forward ladder → hud; plays at rate -0.5 |
        set rate of front document to 0.5 → plays at rate 0.5 | forward ladder → hud; steps forward |
        set rate of front document to 8 → plays at rate 8 | backward ladder → hud; plays at rate 4 |
        backward ladder → hud; plays at rate 2 | backward ladder → hud; plays |
        backward ladder → hud; steps back | backward ladder → hud; steps back |
        set rate of front document to -2 → plays at rate -2 | backward ladder → hud; plays at rate -4 |
        backward ladder → hud; plays at rate -8 | backward ladder → hud; plays at rate -2 |
        set rate of front document to 3 → plays at rate 3 | backward ladder → hud; plays at rate 1.5 |
        set rate of front document to -1 → plays at rate -1 | backward ladder → hud; plays at rate -2 |
        set rate of front document to 0.5 → plays at rate 0.5 | backward ladder → hud; steps back)"},
    {"Slid:", "open slidewell",
     R"(playing? → false | start slideshow → Slidewell takes the display; slide 1 of 12 | playing? → true |
        show next slide → slide 2 of 12 | show previous slide → slide 1 of 12 |
        freeze → slide 1 of 12, frozen | freeze → slide 1 of 12 |
        show last slide of first slideshow → slide 12 of 12 |
        show first slide of first slideshow → slide 1 of 12 | switcher? → false |
        show slide switcher → slide 1 of 12, switcher at 1 | switcher? → true |
        move slide switcher forward → slide 1 of 12, switcher at 2 | cancel slide switcher → slide 1 of 12 |
        show slide switcher → slide 1 of 12, switcher at 1 |
        move slide switcher forward → slide 1 of 12, switcher at 2 |
        move slide switcher forward → slide 1 of 12, switcher at 3 |
        move slide switcher backward → slide 1 of 12, switcher at 2 | accept slide switcher → slide 2 of 12 |
        stop slideshow → Slidewell gives the display back; shows no slides |
        activate → Slidewell comes to the front)"},
    {"Snap:", "open snapvale",
     R"(slideshow? → false | start → Snapvale comes to the front; album "Events", slideshow at photo 1 |
        slideshow? → true | space → key 49 to Snapvale; album "Events", slideshow at photo 1, paused |
        escape → key 53 to Snapvale; album "Events" | command-escape → key Command-53 to Snapvale |
        /front nobody → nothing | command-escape → key Command-53 to nobody |
        start, not waiting → Snapvale comes to the front; album "Events", slideshow at photo 1 |
        stop → album "Events" | stop → nothing)"},
    {"Snap:", "open snapvale",
     R"(next 6 → album "Faces" | next 6 → album "Places" | next 6 → album "Photos" |
        next 6 → album "Last Import" | next 6 → album "Harbour" | next 6 → album "Summer" |
        next 6 → album "Events" | next 7 → album "Faces" | next 7 → album "Places" | next 7 → album "Photos" |
        next 7 → album "Last Import" | next 7 → album "Harbour" | next 7 → album "Summer" |
        next 7 → album "Events" | next 8 → Snapvale comes to the front; album "Photos" |
        next 8 → album "Faces" | next 8 → album "Places" | next 8 → album "Last Import" |
        next 8 → album "Harbour" | next 8 → album "Summer" | next 8 → album "Summer" |
        /front nobody → nothing | previous 8 → album "Harbour" | previous 8 → album "Last Import" |
        previous 8 → Snapvale comes to the front; album "Places" | previous 8 → album "Faces" |
        previous 8 → album "Photos" | previous 8 → key 48 to Snapvale; key 126 to Snapvale; album "Events" |
        previous 8 → nothing | /front nobody → nothing |
        previous 7 → album "Summer"; Snapvale comes to the front; key 48 to Snapvale |
        previous 7 → album "Harbour" | previous 7 → album "Last Import" | previous 7 → album "Photos" |
        previous 7 → album "Places" | previous 7 → album "Faces" | previous 7 → album "Events" |
        previous 6 → album "Summer" | select album 2 → album "Faces" | previous 6 → album "Summer" |
        select album 3 → album "Places" | previous 6 → album "Summer" | select album 4 → album "Photos" |
        previous 6 → album "Summer" | select album 5 → album "Last Import" | previous 6 → album "Summer" |
        select album 6 → album "Harbour" | previous 6 → album "Summer" | select album 7 → album "Summer" |
        previous 6 → album "Summer")"}};

/// Does one step of a story, inside a child.
std::string effectOf(const std::string& code, const std::string& step) {
  journal();
  std::string effect;
  if (step.starts_with('+')) {
    stage::pass(std::stoi(step) * stage::kSecond);
  } else if (step.starts_with('/')) {
    set(step.substr(1));
  } else {
    const tarnscript::Outcome outcome = stage::runScript(scriptText(code + step));
    if (outcome.error) effect = "error\n";
    if (step.ends_with('?') || step.starts_with("get ")) return stage::describe(outcome.value);
  }
  // Whose change it is, is in the text of the change where it matters.
  effect = std::regex_replace(effect + journal(), std::regex("(^|\n)[A-Za-z]+: "), "$1");
  effect = std::regex_replace(effect, std::regex("shows its remote display"), "hud");
  effect = std::regex_replace(effect, std::regex("( in)? \"Dune Walk\""), "");
  if (effect.empty()) return "nothing";
  return std::regex_replace(effect.substr(0, effect.size() - 1), std::regex("\n"), "; ");
}

TEST(Scripts, DoWhatTheySay) {
  std::set<std::string> told;
  for (const Story& story : kStories) {
    const std::string text = std::regex_replace(story.text, std::regex("\\s+"), " ") + " | ";
    std::vector<std::string> steps;
    for (std::size_t at = 0; at < text.size(); at = text.find(" | ", at) + 3) {
      steps.push_back(text.substr(at, text.find(" → ", at) - at));
      told.insert(story.code + steps.back());
    }
    EXPECT_EQ(inChild([&] {
                set(story.start);
                std::string played;
                for (const std::string& step : steps) {
                  played += step + " → " + effectOf(story.code, step) + " | ";
                }
                return played;
              }),
              text);
  }
  for (const auto& [name, text] : scriptTexts())
    EXPECT_TRUE(name.ends_with(':') || told.contains(name)) << name;
}

// clang-format off

TEST(Commands, ThatNoButtonGives) {
  EXPECT_EQ(named(inChild([] {
              set("open slidewell");
              refreshCachedASNs();
              set("open spindle; open com.tarn.vistremeplayer; open VistremePlayerX");
              sent();
              LyraboxCommand_VolumeDown(), DVDCommand_VolumeDown(), DVDCommand_HideController();
              DVDCommand_SetSubtitles(true), DVDCommand_SetSubtitles(false), DVDCommand_FullScreenMode();
              DVDCommand_Activate(), DVDCommand_ResumePlaying(), DVDCommand_PlayFromBeginning();
              DVDCommand_Play(), DVDCommand_Select(), SlidewellCommand_Activate();
              VistremeCommand_VolumeDown(), VistremeCommand_Play(), VistremeCommand_FullScreenMode();
              VistremeCommand_Activate(), VistremeXCommand_FullScreenMode(), VistremeXCommand_VolumeDown();
              VistremeXCommand_Activate(), VistremeXCommand_Resume(), VistremeXCommand_Play();
              VistremeXCommand_Resume(), VistremeCommand_Resume();
              return sent();
            })),
            "Lyra:volume down; Spin:volume down; Spin:set controller visibility to false; "
            "Spin:set displaying subtitle to true; Spin:set displaying subtitle to false; "
            "Spin:set viewer full screen to true; Spin:activate; Spin:go return to dvd; "
            "Slid:stop slideshow; Spin:play from beginning; Slid:stop slideshow; Spin:play dvd; "
            "Slid:stop slideshow; Spin:press enter key; Slid:activate; "
            "Vist:volume down; Vist:play frontMovie; Vist:set viewer full screen to true; "
            "Vist:activate; VstX:volume down; VstX:activate; VstX:rate 0; VstX:hud play; VstX:playing?; "
            "VstX:rate 1; Vist:set rate of front movie to 0.0; ")
      << "each of the two movie players remembers for itself whether it played";
}

TEST(Queries, ThatNoButtonMakes) {
  EXPECT_EQ(named(inChild([] {
              set("open spindle; open com.tarn.vistremeplayer; open VistremePlayerX; open snapvale");
              std::string text;
              const auto ask = [&](const std::string& before, auto query) {
                set(before);
                sent();
                const auto answer = query();
                text += sent() + std::to_string(answer) + "; ";
              };
              const std::string disc = "tell spindle to set audio volume to ";
              const std::string modern = "tell VistremePlayerX to set ";
              const std::string movie = "tell com.tarn.vistremeplayer to set sound volume of front movie to ";
              for (const char* volume : {"255", "128", "0"}) ask(disc + volume, Spindle_GetVolume);
              for (const char* volume : {"256", "128"}) ask(movie + volume, VistremePlayer_GetVolume);
              ask(modern + "audio volume of front document to 1", VistremePlayerX_GetVolume);
              ask(modern + "rate of front document to 2.5", VistremePlayerX_GetScanRate);
              ask("tell snapvale to start slideshow", SnapvaleSlideShowPlaying);
              ask("tell spindle to set displaying subtitle to true", Spindle_DisplayingSubtitles);
              ask("tell spindle to play dvd", Spindle_IsPaused);
              ask("tell spindle to pause dvd", Spindle_IsPaused);
              ask("mute off", [] { return Spindle_GetPlayerState() == FourCC("espa"); });
              ask("mute off", Spindle_HasMedia);
              ask("answers spindle errors", Spindle_GetActiveMenu);
              const std::string unset = scriptText("Vist:play frontMovie");
              ask("mute off", [&] { return !HandleScriptWithResult(unset.c_str()); });
              return text;
            })),
            "Spin:get audio volume; 100; Spin:get audio volume; 50; Spin:get audio volume; 0; "
            "Vist:get sound volume of front movie; 100; Vist:get sound volume of front movie; 50; "
            "VstX:get audio volume of front document; 0; VstX:rate?; 2; Snap:slideshow?; 1; "
            "Spin:get displaying subtitle; 1; Spin:state?; 0; Spin:state?; 1; Spin:state?; 1; "
            "Spin:get has media; 1; Spin:get active dvd menu; 0; Vist:play frontMovie; 1; ");
}

// clang-format on

}  // namespace
