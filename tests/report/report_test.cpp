// Whole reports about a desktop of fake programs and windows, and that none of it is done.

#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cstdio>
#include <cstdlib>
#include <regex>
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

/// What a fresh kvd-report would say, and behind it whatever has reached programs and windows.
std::string reportOn(const std::string& button) {
  int ends[2];
  if (pipe(ends) != 0) std::abort();
  const pid_t child = fork();
  if (child == 0) {
    linux::host::init({&fake::kWindows});
    std::string text = button.empty()
                           ? report::desktopText(report::describeDesktop())
                           : report::buttonText(report::describeButton(remote::knownButton(button)));
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
  text = std::regex_replace(text, std::regex(R"(\([0-9]+\))"), "(1)");
  return std::regex_replace(text, std::regex(std::getenv("XDG_RUNTIME_DIR")), "/run");
}

void openWindow(const std::string& title, const std::string& program, const std::string& className) {
  const fake::Program& owner = fake::program(program);
  fake::openWindow(title, owner.process, owner.uniqueName).className = className;
}

void bringToFront(const std::string& title) {
  for (auto& each : fake::screen().windows) each.isActive = each.title == title;
}

TEST(Report, Play) {
  fake::beginSession();
  fake::writeEntry("cinema", {"Categories=AudioVideo;Player;Video;"});
  fake::writeEntry("chat", {"X-Kvd-Application=none"});
  const auto player = [](const char* name, std::vector<std::string> words) {
    words.push_back(std::string("owns=org.mpris.MediaPlayer2.") + name);
    fake::startProgram(name, name, words);
  };
  player("strawberry", {"title=Song", "length=3m", "Position=62s", "playing"});
  player("mpv", {"title=Dune", "length=2h"});
  player("vlc", {"stopped"});
  player("cinema", {"DesktopEntry=cinema"});
  player("chat", {"DesktopEntry=chat"});
  player("playerctld", {});
  player("stranger", {});
  fake::startProgram("evince", "evince", {});
  openWindow("Letter", "chat", "gedit");
  openWindow("Talk", "evince", "evince");
  openWindow("Dune", "mpv", "mpv");
  fake::window("Dune").isFullScreen = true;
  bringToFront("Dune");
  for (const char* b : {"", "play", "right", "volume-up", "forward"}) std::puts(reportOn(b).c_str());
  bringToFront("Talk");
  fake::screen().reach = linux::windows::Reach::FocusedWindow;
  for (const char* b : {"play", "right","stop"}) std::puts(reportOn(b).c_str());
  bringToFront("");
  for (const char* b : {"play", "menu"}) std::puts(reportOn(b).c_str());
  fake::tellProgram("strawberry", "paused");
  for (const char* b : {"play", "pick"}) std::puts(reportOn(b).c_str());
  for (const char* name : {"strawberry", "mpv", "vlc", "cinema"}) fake::endProgram(name);
  for (const char* b : {"play"}) std::puts(reportOn(b).c_str());
  fake::endSession();
}

}  // namespace
