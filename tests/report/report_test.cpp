// Whole reports about a desktop of fake programs and windows, of which nothing is done.

#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <regex>
#include <sstream>
#include <string>
#include <vector>

#include "platform/linux/host/host.h"
#include "report/arguments.h"
#include "report/button.h"
#include "report/desktop.h"
#include "report/text.h"
#include "tests/linux/fake_session.h"
#include "tests/linux/fake_windows.h"

namespace {

using linux::windows::Reach;

/// The names of all members, one a line.
std::string membersOf(const report::Object& object) {
  std::string names;
  for (const auto& [name, value] : object.items()) {
    if (object.is_object()) names += name + "\n";
    if (value.is_structured() && name != "here") names += membersOf(value);
  }
  return names;
}

/// What a kvd-report that has just been started says, and behind it whatever has reached programs and
/// windows.
std::string reportOn(const std::string& button, bool members = false) {
  int ends[2];
  if (pipe(ends) != 0) std::abort();
  const pid_t child = fork();
  if (child == 0) {
    linux::host::init({&fake::kWindows}, linux::windows::Use::Looking);
    const report::Object object =
        button.empty() ? report::describeDesktop() : report::describeButton(remote::knownButton(button));
    std::string text = members          ? membersOf(object)
                       : button.empty() ? report::desktopText(object)
                                        : report::buttonText(object);
    for (const std::string& line : fake::takeJournal()) text += "DONE: " + line + "\n";
    _exit(write(ends[1], text.data(), text.size()) == static_cast<ssize_t>(text.size()) ? 0 : 1);
  }
  close(ends[1]);
  std::string text;
  std::array<char, 4096> part{};
  for (ssize_t count = 0; (count = read(ends[0], part.data(), part.size())) > 0;) {
    text.append(part.data(), static_cast<std::size_t>(count));
  }
  close(ends[0]);
  waitpid(child, nullptr, 0);
  text = std::regex_replace(text, std::regex(R"(\([0-9]+\)  +)"), "()  ");
  text = std::regex_replace(text, std::regex(R"(\([0-9]+\))"), "()");
  return std::regex_replace(text, std::regex(std::getenv("XDG_RUNTIME_DIR")), "/run");
}

void openWindow(const std::string& title, const std::string& program, const std::string& className) {
  const fake::Program& owner = fake::program(program);
  fake::openWindow(title, owner.process, owner.uniqueName).className = className;
}

void bringToFront(const std::string& title) {
  for (auto& each : fake::screen().windows) each.isActive = each.title == title;
}

void expectReport(const std::string& button, const std::string& expected) {
  EXPECT_EQ("\n" + reportOn(button), expected) << "kvd-report " << button;
}

TEST(Report, TellsWhatKvdSeesAndWouldDo) {
  fake::beginSession();
  fake::writeEntry("cinema", {"Categories=AudioVideo;Player;Video;"});
  fake::writeEntry("chat", {"X-Kvd-Application=none"});
  fake::writeEntry("org.strawberrymusicplayer.strawberry", {});
  fake::writeEntry("org.gnome.eog", {"X-Kvd-Application=com.tarn.Snapvale"});
  const auto player = [](const char* name, std::vector<std::string> words) {
    words.push_back(std::string("owns=org.mpris.MediaPlayer2.") + name);
    fake::startProgram(name, name, words);
  };
  player("strawberry", {"title=Song\x1b[2J", "length=3m", "Position=62s", "playing"});
  player("mpv.instance2", {"playing"});
  player("mpv", {"title=Dune", "length=2h"});
  player("cinema", {"DesktopEntry=cinema"});
  player("chat", {"DesktopEntry=chat"});
  fake::startProgram("eog", "eog", {"windows=1"});
  fake::startProgram("darktable", "darktable", {});
  openWindow("Photos", "darktable", "darktable");
  openWindow("Letter", "darktable", "gedit");
  openWindow("Dune", "mpv", "mpv");
  fake::window("Letter").process = 1;
  fake::window("Dune").isFullScreen = true;
  bringToFront("Dune");
  expectReport("", R"(
kvd 0.1.0

Session
  desktop               none of the variables that tell of one is set
  service manager       not on the session bus

Window systems
  none                  open

In front
  has the remote        kvd
  window                "Dune", of class mpv
  program               mpv (), classic movie player

Programs with a role
  Strawberry ()  music player, playing "Song [2J" at 1:02 of 3:00
                        known by its bus name (table of programs)
  mpv ()  classic movie player, paused "Dune" at 0:00 of 2:00:00, in front
                        known by its bus name (table of programs)
                        window "Dune", full screen
  mpv ()  classic movie player, playing at 0:00
                        known by its bus name (table of programs)
  cinema ()  modern movie player, paused at 0:00
                        known by the categories of its desktop entry
  Eye of GNOME ()  photo library
                        known by X-Kvd-Application in its desktop entry
  darktable ()  professional photos
                        known by its window's class (table of programs)
                        window "Photos"

Players and windows without a role
  player                chat: X-Kvd-Application in its desktop entry says so
  window                "Letter", of class gedit: neither the table of programs nor a desktop entry
                        gives it one

Outputs
  1280x720 at 0,0       captured by a full-screen window

Sound
  server                none answers

Service
  socket                /run/com.tarn.kvd
  listens               nobody: buttons get lost
)");
  expectReport("play", R"(
What the button play would do now

  goes to               mpv (), classic movie player: it is in front

Silenced first
  Strawberry ()  pause
  Eye of GNOME ()  stop slideshow: by its action win.view-slideshow=false, else by key Escape
                        (lost: it is not in front)
  darktable ()  key Escape: by key Escape F11
  cinema ()  stop document

Told
  mpv ()  play movie

Where it begins to play, mpv (), which plays too, is paused: one of a kind at a time.
)");
  expectReport("forward", R"(
What the button forward would do now

  goes to               mpv (), classic movie player: it is in front

Told
  mpv ()  set rate to 2

Told when it is released
  mpv ()  set rate to 0

Where it begins to play, mpv (), which plays too, is paused: one of a kind at a time.
)");
  expectReport("volume-up", R"(
What the button volume-up would do now

  goes to               the sound: a volume button, whoever plays

Told
  the desktop           sound key, but no sound server answers

Held down it is repeated.
)");
  bringToFront("Photos");
  fake::window("Dune").isFullScreen = false;
  expectReport("playpause", R"(
What the button playpause would do now

  goes to               darktable (), professional photos: it is in front

Silenced first
  Strawberry ()  pause
  Eye of GNOME ()  stop slideshow: by its action win.view-slideshow=false, else by key Escape
                        (lost: it is not in front)
  cinema ()  stop document
  mpv ()  stop movie

Told
  darktable ()  key Shift+S: by key s
  darktable ()  key Return: by key F11
)");
  fake::screen().reach = Reach::Nobody;
  expectReport("left", R"(
What the button left would do now

  goes to               darktable (), professional photos: it is in front

Told
  darktable ()  key Left (lost: none reaches it)
)");
  bringToFront("");
  expectReport("pick", R"(
What the button pick would do now

  goes to               Strawberry (), music player: it plays

Silenced first
  Eye of GNOME ()  stop slideshow: by its action win.view-slideshow=false, else by key Escape
                        (lost: it is not in front)
  cinema ()  stop document
  mpv ()  stop movie

Told
  Strawberry ()  come to the front
)");
  const std::string members = reportOn("", true) + reportOn("forward", true);
  for (const char* name : {"strawberry", "mpv.instance2"}) fake::tellProgram(name, "paused");
  player("rhythmbox", {});
  expectReport("next", R"(
What the button next would do now

  goes to               Rhythmbox (), music player: it is the first player that runs

Told
  Rhythmbox ()  next track: by MPRIS2 Next

A running kvd remembers the player that was in front or played at an earlier button and would choose
that one first; this program cannot know it.

Several programs of this kind run. A running kvd takes the one that last played or was told
something; this program cannot know that and takes the one that was started last.
)");
  for (const char* name : {"strawberry", "rhythmbox", "mpv", "mpv.instance2", "cinema"})
    fake::endProgram(name);
  expectReport("play", R"(
What the button play would do now

  goes to               nobody: no player is in front, plays or runs

Told
  Strawberry            start

Not while the screen is locked.
)");
  fake::endSession();

  std::ifstream file(KVD_MANUAL);
  const std::string manual(std::istreambuf_iterator<char>(file), {});
  std::istringstream names(members);
  for (std::string name; std::getline(names, name);) {
    EXPECT_TRUE(std::regex_search(manual, std::regex("[. ]" + name + "\\b"))) << name;
  }
}

TEST(Report, AnswersCommandLines) {
  const auto status = [](const std::string& arguments) {
    const std::string command = std::string("env -i ") + KVD_REPORT + " " + arguments + " >/dev/null 2>&1";
    return WEXITSTATUS(std::system(command.c_str()));
  };
  for (const char* good : {"", "play", "Play/Pause --json", "--help", "--version", "--version nonsense"}) {
    EXPECT_EQ(status(good), 0) << good << ", on a desktop with nothing";
  }
  for (const char* bad : {"pley", "play pause", "--jason", "\"\""}) EXPECT_EQ(status(bad), 2) << bad;
}

}  // namespace
