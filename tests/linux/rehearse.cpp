// rehearse: plays a transcript of kvd on a desktop of fake programs and windows, in virtual time.
//
// Commands come on standard input; each is written again, and indented under it what has reached programs,
// their channels and windows. Lines that begin with a blank are an earlier transcript's and are passed over.
//
// - player NAME WORD…: a player starts, org.mpris.MediaPlayer2.NAME, or as=OTHER; see fake_player.cpp
// - program NAME WORD…: the same for a program that is no player
// - NAME: WORD…: somebody does something there
// - quit NAME; stop NAME and continue NAME, as the signals do
// - window TITLE of PROGRAM|nobody WORD…: opens one: class=, id=, area=X,Y,W,H, full-screen, dialog
// - window TITLE WORD…: changes it: ordinary and hidden too
// - close TITLE; front TITLE|nobody|unknown; keys any|focused|nobody; outputs X,Y,W,H…
// - entry ID KEY=VALUE…: a desktop entry
// - start: kvd starts
// - tap, press, release BUTTON; lock on|off; wait TIME
// - tell APPLICATION to …: a script as the core runs one

#include <unistd.h>

#include <algorithm>
#include <iostream>
#include <iterator>
#include <optional>
#include <sstream>
#include <string>
#include <type_traits>
#include <vector>

#include "daemon/lifecycle.h"
#include "messages/kvd_messages.h"
#include "platform/linux/host/host.h"
#include "platform/stage/clock.h"
#include "platform/stage/fold.h"
#include "platform/stage/line_reader.h"
#include "remote/buttons.h"
#include "remote/kvd_client.h"
#include "remote/words.h"
#include "tests/linux/fake_session.h"
#include "tests/linux/fake_windows.h"

namespace {

using linux::windows::Area;
using linux::windows::Reach;
using linux::windows::Window;
using remote::UsageError;
using stage::Nanoseconds;
using Words = std::vector<std::string>;

stage::LineReader sReader(STDIN_FILENO);
stage::Fold sLines;
Nanoseconds sCommandStart = stage::kVirtualStart;
/// While time passes.
std::optional<Nanoseconds> sWaitEnd;
bool sStarted = false;
bool sFailed = false;

void say(const std::string& text) { sLines.add(text, stage::now() - sCommandStart); }

void sayJournal() {
  for (const std::string& text : fake::takeJournal()) say(text);
}

// ---- Commands

template <typename... Fields>
void send(mach_msg_return_t (*stub)(mach_port_t, Fields...), std::type_identity_t<Fields>... fields) {
  mach_port_t port = MACH_PORT_NULL;
  kvd_look_up(&port);
  if (stub(port, fields...) != MACH_MSG_SUCCESS) throw UsageError("nobody listens");
}

void sendButton(const std::string& name, std::int32_t value) {
  const remote::Button& button = remote::knownButton(name);
  send(kvd_handlehidevent, button.usagePage, button.usage, 0, value);
}

void tap(const std::string& name) {
  for (const std::int32_t value : remote::tapValues(remote::knownButton(name))) sendButton(name, value);
}

void tell(const std::string& line) {
  const std::size_t to = line.find(" to ");
  const std::string told =
      fake::runScript("tell application \"" + line.substr(5, to - 5) + "\"" + line.substr(to));
  sayJournal();
  // The other words answer nothing.
  if (told.starts_with("fails") || line.find(" get ") != std::string::npos) say(told);
}

/// The value of a word "KEY=…", which is taken out of the words.
std::optional<std::string> takeValue(Words& words, const std::string& key) {
  const auto found =
      std::ranges::find_if(words, [&](const auto& word) { return word.starts_with(key + "="); });
  if (found == words.end()) return std::nullopt;
  const std::string value = found->substr(key.size() + 1);
  words.erase(found);
  return value;
}

void startProgram(Words words, const std::string& prefix) {
  const std::string name = words.at(0);
  words.erase(words.begin());
  const std::string busName = takeValue(words, "as").value_or(name);
  if (!prefix.empty()) words.push_back("owns=" + prefix + busName);
  fake::startProgram(name, name, words);
}

Area areaOf(const std::string& text) {
  Area area;
  char comma = 0;
  std::istringstream(text) >> area.x >> comma >> area.y >> comma >> area.width >> comma >> area.height;
  return area;
}

void setWindow(Words words) {
  const bool opens = words.at(1) == "of";
  if (opens) {
    const fake::Program owner = words.at(2) != "nobody" ? fake::program(words.at(2)) : fake::Program();
    fake::openWindow(words.at(0), owner.process, owner.uniqueName);
  }
  Window& window = fake::window(words.at(0));
  words.erase(words.begin(), words.begin() + (opens ? 3 : 1));
  if (const auto name = takeValue(words, "class")) window.className = *name;
  if (const auto id = takeValue(words, "id")) window.applicationID = *id;
  if (const auto area = takeValue(words, "area")) window.area = areaOf(*area);
  for (const std::string& word : words) {
    if (word == "full-screen") window.isFullScreen = true;
    if (word == "ordinary") window.isFullScreen = false;
    if (word == "hidden") window.isShown = false;
    if (word == "dialog") window.isDialog = true;
  }
}

void close(const std::string& title) {
  std::erase_if(fake::screen().windows, [&](const Window& each) { return each.title == title; });
  fake::screen().changed = true;
}

void front(const std::string& title) {
  fake::screen().knowsFront = title != "unknown";
  for (Window& each : fake::screen().windows) each.isActive = each.title == title;
  fake::screen().changed = true;
}

void setOutputs(Words words) {
  fake::screen().outputs.clear();
  for (std::uint32_t id = 0; const std::string& word : words) {
    fake::screen().outputs.push_back({++id, areaOf(word)});
  }
}

void setReach(const std::string& word) {
  fake::screen().reach = word == "any"       ? Reach::AnyWindow
                         : word == "focused" ? Reach::FocusedWindow
                                             : Reach::Nobody;
}

struct Command {
  const char* name;
  void (*run)(Words words);
};

constexpr Command kCommands[] = {
    {"player", [](Words words) { startProgram(words, "org.mpris.MediaPlayer2."); }},
    {"program", [](Words words) { startProgram(words, ""); }},
    {"quit", [](Words words) { fake::endProgram(words.at(0)); }},
    {"stop", [](Words words) { fake::freeze(words.at(0), true); }},
    {"continue", [](Words words) { fake::freeze(words.at(0), false); }},
    {"window", setWindow},
    {"close", [](Words words) { close(words.at(0)); }},
    {"front", [](Words words) { front(words.at(0)); }},
    {"keys", [](Words words) { setReach(words.at(0)); }},
    {"outputs", setOutputs},
    {"entry",
     [](Words words) {
       fake::writeEntry(words.at(0), {words.begin() + 1, words.end()});
     }},
    {"start", [](Words) { sStarted = true; }},
    {"tap", [](Words words) { tap(words.at(0)); }},
    {"press", [](Words words) { sendButton(words.at(0), remote::kPressed); }},
    {"release", [](Words words) { sendButton(words.at(0), remote::kReleased); }},
    {"lock", [](Words words) { send(kvd_setscreenlocked, words.at(0) == "on" ? 1 : 0); }},
    {"wait", [](Words words) { sWaitEnd = stage::now() + remote::parseTime(words.at(0)).count(); }},
};

void run(const std::string& line) {
  if (line.empty() || line.front() == '#') return;
  std::istringstream stream(line);
  Words words{std::istream_iterator<std::string>(stream), {}};
  const std::string name = words.front();
  words.erase(words.begin());
  if (name == "tell") return tell(line);
  if (name.ends_with(':'))
    return fake::tellProgram(name.substr(0, name.size() - 1), line.substr(name.size()));
  const auto* const command = std::ranges::find(kCommands, name, &Command::name);
  if (command == std::end(kCommands)) throw UsageError("unknown command " + remote::inQuotes(name));
  command->run(words);
}

// ---- The play

std::optional<std::string> nextCommand() {
  while (auto line = sReader.next(-1)) {
    if (!line->starts_with(' ')) return line;
  }
  return std::nullopt;
}

/// Performs the next command. False at the end of the input.
bool performNext() {
  const auto line = nextCommand();
  sLines.write(std::cout);
  if (!line) return false;
  std::cout << *line << std::endl;
  sCommandStart = stage::now();
  try {
    run(*line);
  } catch (const std::exception& error) {
    say(std::string("error: ") + error.what());
    sFailed = true;
  }
  return true;
}

/// Moves time to the next thing that happens, or to the end of the wait.
void moveTime(std::optional<Nanoseconds> deadline) {
  const bool timerIsFirst = deadline && *deadline <= *sWaitEnd;
  stage::advanceTo(timerIsFirst ? *deadline : *sWaitEnd);
  if (!timerIsFirst) sWaitEnd.reset();
}

/// The loop has nothing to do. Once it has nothing to do although all that was sent has arrived, time moves,
/// or else the next command is read.
void onIdle(std::optional<Nanoseconds> deadline) {
  static std::uint64_t settled = 0;
  if (base::turn() != settled + 1) {
    sayJournal();
    settled = base::turn();
  } else if (sWaitEnd) {
    moveTime(deadline);
  } else if (!performNext()) {
    send(kvd_terminate);
  }
}

/// A button's own sleeps are none of the transcript's time.
void passTime(Nanoseconds duration) {
  stage::pass(duration);
  sCommandStart += duration;
}

}  // namespace

int main() {
  base::endLoopOnSignals();
  stage::useVirtualTime();
  base::setTimeSource({stage::now, onIdle, passTime});
  fake::beginSession();
  while (!sStarted && performNext()) {
  }
  linux::host::init({&fake::kWindows});
  if (KVDMain() != 0) say("error: kvd does not start");
  linux::host::finish();
  fake::endSession();
  if (base::aliveByKind()[static_cast<std::size_t>(base::Kind::Timer)] != 0) say("error: a timer is left");
  sLines.write(std::cout);
  return sFailed ? 1 : 0;
}
