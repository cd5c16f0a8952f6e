// fake_player WORD…: a program on the session bus, a player (MPRIS 2.2) above all, that does as it is told.
//
// Its words come on the command line and, a line of them at a time, on standard input:
//
// - owns=NAME: a name on the bus, $PID in it stands for the process; drops=NAME
// - playing, paused, stopped: does so and announces it, as if somebody did that by hand
// - PROPERTY=VALUE: a property of MPRIS2, or the title, url, length or track of what it plays
// - PROPERTY:TYPE=VALUE: the same with a type that it should not have
// - toggles: Play and Pause both toggle; silent: announces nothing; counts: tells of questions too
// - says=STATUS: tells this status whatever it does, until says=
// - ignores=METHOD: answers and does nothing; refuses=, dies=, and to end all these obeys=. For Set the
// property, for mpv's channel the command
// - holds=METHOD: answers when it is told: answers
// - win.NAME=BOOLEAN: the state of a GTK action, at the path /win/TITLE; or that it is disabled, or none
// - windows=NAME,NAME…: the objects of its windows; windows= for none
// - hears=INTERFACE: tells of its signals
// - channel=FILE: listens there and speaks like mpv, or like VLC where its executable is called vlc
// - rc.title=0/3: what VLC answers to "title"; rc.chapter likewise
//
// It writes "ready UNIQUE-NAME", and then a line "SERIAL NANOSECONDS TEXT" for every call that reaches it:
// its caller's number for it (0 for what comes over the channel), and CLOCK_MONOTONIC. A line of input is
// answered with "done" once all that was sent before it has been taken in, and with "! WORD" where a word is
// wrong.

#include <poll.h>
#include <systemd/sd-bus.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cstdint>
#include <cstdlib>
#include <functional>
#include <iostream>
#include <iterator>
#include <map>
#include <nlohmann/json.hpp>
#include <optional>
#include <sstream>
#include <string>
#include <string_view>
#include <vector>

#include "remote/words.h"
#include "tests/linux/line_server.h"

namespace {

constexpr const char* kPath = "/org/mpris/MediaPlayer2";
constexpr const char* kRoot = "org.mpris.MediaPlayer2";
constexpr const char* kPlayer = "org.mpris.MediaPlayer2.Player";
constexpr const char* kTrackList = "org.mpris.MediaPlayer2.TrackList";
/// No interface, but a dictionary like theirs.
constexpr const char* kMetadata = "Metadata";

struct Property {
  std::string_view word;
  const char* interface;
  const char* key;
  std::string type;
  std::optional<std::string> value;
};

Property properties[] = {
    {"DesktopEntry", kRoot, "DesktopEntry", "s", {}},
    {"Fullscreen", kRoot, "Fullscreen", "b", {}},
    {"PlaybackStatus", kPlayer, "PlaybackStatus", "s", "Paused"},
    {"Rate", kPlayer, "Rate", "d", "1"},
    {"MinimumRate", kPlayer, "MinimumRate", "d", "1"},
    {"MaximumRate", kPlayer, "MaximumRate", "d", "1"},
    {"Volume", kPlayer, "Volume", "d", "1"},
    {"Position", kPlayer, "Position", "x", "0"},
    {"CanControl", kPlayer, "CanControl", "b", "true"},
    {"CanPlay", kPlayer, "CanPlay", "b", "true"},
    {"CanPause", kPlayer, "CanPause", "b", "true"},
    {"CanSeek", kPlayer, "CanSeek", "b", "true"},
    {"CanGoNext", kPlayer, "CanGoNext", "b", "true"},
    {"CanGoPrevious", kPlayer, "CanGoPrevious", "b", "true"},
    {"Metadata", kPlayer, "Metadata", "a{sv}", ""},
    {"title", kMetadata, "xesam:title", "s", {}},
    {"url", kMetadata, "xesam:url", "s", {}},
    {"length", kMetadata, "mpris:length", "x", {}},
    {"track", kMetadata, "mpris:trackid", "o", "/track/1"},
    {"Tracks", kTrackList, "Tracks", "ao", {}},
};

sd_bus* bus = nullptr;
std::vector<sd_bus_message*> held;
/// The other words that it was told; "ignores" and its like by the method that they are about.
std::map<std::string, std::string> notes;

std::string note(const std::string& name) { return notes.contains(name) ? notes[name] : ""; }

Property& property(std::string_view word) {
  const auto found = std::ranges::find(properties, word, &Property::word);
  if (found == std::end(properties)) throw remote::UsageError("no property");
  return *found;
}

void tell(std::uint64_t serial, const std::string& text) {
  const auto now = std::chrono::steady_clock::now().time_since_epoch();
  std::cout << serial << ' ' << std::chrono::nanoseconds(now).count() << ' ' << text << std::endl;
}

// ---- Values on the bus

void appendAll(sd_bus_message* message, std::string_view interface);

void appendVariant(sd_bus_message* message, const Property& told) {
  const bool pretends = told.word == "PlaybackStatus" && !note("says").empty();
  const std::string text = pretends ? note("says") : *told.value;
  const std::string& type = told.type;
  if (type == "a{sv}") {
    sd_bus_message_open_container(message, 'v', "a{sv}");
    appendAll(message, kMetadata);
    sd_bus_message_close_container(message);
  }
  const std::size_t comma = text.find(',');
  if (type == "ao")
    sd_bus_message_append(message, "v", "ao", 2, text.substr(0, comma).c_str(),
                          text.substr(comma + 1).c_str());
  if (type == "b") sd_bus_message_append(message, "v", "b", text == "true" ? 1 : 0);
  if (type == "d") sd_bus_message_append(message, "v", "d", std::stod(text));
  if (type == "x") sd_bus_message_append(message, "v", "x", std::int64_t{std::stoll(text)});
  if (type == "s" || type == "o") sd_bus_message_append(message, "v", type.c_str(), text.c_str());
}

void appendAll(sd_bus_message* message, std::string_view interface) {
  sd_bus_message_open_container(message, 'a', "{sv}");
  for (const Property& told : properties) {
    if (interface != told.interface || !told.value) continue;
    sd_bus_message_open_container(message, 'e', "sv");
    sd_bus_message_append(message, "s", told.key);
    appendVariant(message, told);
    sd_bus_message_close_container(message);
  }
  sd_bus_message_close_container(message);
}

/// The plain values of a call, as people write them: times as "2.5s"; "" for lists.
std::vector<std::string> argumentsOf(sd_bus_message* call) {
  std::vector<std::string> arguments;
  char type = 0;
  const char* contents = nullptr;
  sd_bus_message_rewind(call, 1);
  while (sd_bus_message_peek_type(call, &type, &contents) > 0) {
    if (type == 'v') {
      sd_bus_message_enter_container(call, type, contents);
      continue;
    }
    union {
      const char* text;
      double real;
      std::int64_t time;
      std::int32_t number;
    } value{};
    if (type == 'a') {
      sd_bus_message_skip(call, nullptr);
    } else {
      sd_bus_message_read_basic(call, type, &value);
    }
    std::ostringstream word;
    if (type == 's' || type == 'o') word << value.text;
    if (type == 'd') word << value.real;
    if (type == 'x') word << static_cast<double>(value.time) / 1e6 << "s";
    if (type == 'b') word << std::boolalpha << (value.number != 0);
    if (type == 'i' || type == 'u') word << value.number;
    arguments.push_back(word.str());
  }
  return arguments;
}

// ---- What it does

void setStatus(const std::string& status) {
  property("PlaybackStatus").value = status;
  if (notes.contains("silent")) return;
  const std::string told = note("says").empty() ? status : note("says");
  sd_bus_emit_signal(bus, kPath, "org.freedesktop.DBus.Properties", "PropertiesChanged", "sa{sv}as", kPlayer,
                     1, "PlaybackStatus", "s", told.c_str(), 0);
}

void setPosition(double seconds) {
  property("Position").value = std::to_string(static_cast<std::int64_t>(std::max(seconds, 0.0) * 1e6));
}

void obey(const std::string& method, const std::vector<std::string>& arguments) {
  const bool plays = property("PlaybackStatus").value == "Playing";
  const bool toggles = notes.contains("toggles") || method == "PlayPause";
  if (method == "Play" || method == "PlayPause" || method == "GoTo") {
    setStatus(plays && toggles ? "Paused" : "Playing");
  } else if (method == "Pause" && (plays || toggles)) {
    setStatus(plays ? "Paused" : "Playing");
  } else if (method == "Stop") {
    setStatus("Stopped");
  } else if (method == "SetPosition") {
    setPosition(std::stod(arguments.at(1)));
  } else if (method == "Seek") {
    setPosition(std::stod(*property("Position").value) / 1e6 + std::stod(arguments.at(0)));
  } else if (method == "Set") {
    property(arguments.at(1)).value = arguments.at(2);
  } else if (method == "SetState") {
    notes["win." + arguments.at(0)] = arguments.at(1);
  }
}

/// As GTK tells of them.
std::string windowObjects() {
  std::string told = "<node>";
  std::istringstream names(note("windows"));
  for (std::string name; std::getline(names, name, ',');) told += "<node name=\"" + name + "\"/>";
  return told + "</node>";
}

void answer(sd_bus_message* call) {
  const std::string method = sd_bus_message_get_member(call);
  const std::vector<std::string> arguments = argumentsOf(call);
  if (note(method == "Set" ? arguments.at(1) : method) != "ignores") obey(method, arguments);
  if (sd_bus_message_get_expect_reply(call) <= 0) return;
  sd_bus_message* reply = nullptr;
  sd_bus_message_new_method_return(call, &reply);
  if (method == "GetAll") appendAll(reply, arguments.at(0));
  if (method == "Get") appendVariant(reply, property(arguments.at(1)));
  if (method == "Introspect") sd_bus_message_append(reply, "s", windowObjects().c_str());
  if (method == "Notify") sd_bus_message_append(reply, "u", 7);
  if (method == "Describe") {
    const std::string state = note("win." + arguments.at(0));
    sd_bus_message_append(reply, "(bgav)", state != "disabled", "", 1, "b", state == "true");
  }
  sd_bus_send(bus, reply, nullptr);
  sd_bus_message_unref(reply);
}

/// "SetPosition /track/1 30s", "Set Rate 2", "Activate win.fullscreen of Photo" (at the path /win/Photo).
std::string textOf(sd_bus_message* call) {
  std::string text = sd_bus_message_get_member(call);
  std::vector<std::string> words = argumentsOf(call);
  if (text == "Set") words.erase(words.begin());
  const std::string_view interface = sd_bus_message_get_interface(call);
  if (interface == "org.gtk.Actions") words.front().insert(0, "win.");
  if (interface == "org.gtk.Actions" || interface == "org.freedesktop.Application") {
    const std::string path = sd_bus_message_get_path(call);
    words.push_back("of " + path.substr(path.rfind('/') + 1));
  }
  for (const std::string& word : words) text += word.empty() ? "" : " " + word;
  return text;
}

std::string talk(const std::string& line);

int onMessage(sd_bus_message* call, void*, sd_bus_error*) {
  const char* const interface = sd_bus_message_get_interface(call);
  if (interface != nullptr && interface == note("hears")) tell(0, textOf(call));
  if (sd_bus_message_is_method_call(call, nullptr, nullptr) <= 0) return 0;
  // Whoever waits for the answer has written to the channel before, if at all.
  if (sd_bus_message_get_expect_reply(call) > 0) serveLines(talk);
  const std::string member = sd_bus_message_get_member(call);
  const bool question =
      member == "Get" || member == "GetAll" || member == "Describe" || member == "Introspect";
  std::uint64_t serial = 0;
  sd_bus_message_get_cookie(call, &serial);
  if (!question || notes.contains("counts")) tell(serial, textOf(call));
  const std::string reaction = note(member == "Set" ? argumentsOf(call).at(1) : member);
  const bool lacksIt = member == "Describe" && note("win." + argumentsOf(call).at(0)) == "none";
  if (reaction == "dies") std::exit(0);
  if (reaction == "holds") {
    held.push_back(sd_bus_message_ref(call));
  } else if (reaction == "refuses" || lacksIt) {
    sd_bus_reply_method_errorf(call, SD_BUS_ERROR_FAILED, "this is not done here");
  } else {
    answer(call);
  }
  return 1;
}

std::string talkLikeMpv(const std::string& line) {
  const auto request = nlohmann::json::parse(line);
  std::string command;
  for (const auto& word : request["command"]) {
    if (word.is_string()) command += (command.empty() ? "" : " ") + word.get<std::string>();
  }
  std::ranges::replace(command, '\n', '|');
  tell(0, "channel: " + command);
  const nlohmann::json reply{{"request_id", request["request_id"]},
                             {"error", note(command) == "refuses" ? "invalid parameter" : "success"}};
  return "{\"event\":\"seek\"}\n" + reply.dump() + "\n";
}

std::string talkLikeVlc(const std::string& line) {
  const std::string place = note("rc." + line);
  const bool paused = property("PlaybackStatus").value == "Paused";
  if (place.empty() || notes.contains("counts")) tell(0, "channel: " + line);
  std::string reply = "status change: ( new input: 1/2.mkv )\r\n";
  if (!place.empty()) reply += paused ? "Press pause to continue.\r\n" : "Currently at " + place + ".\r\n";
  return reply + line + ": returned 0 (no error)\r\n";
}

std::string talk(const std::string& line) {
  return program_invocation_short_name == std::string_view("vlc") ? talkLikeVlc(line) : talkLikeMpv(line);
}

// ---- Words

void own(std::string name) {
  const std::size_t at = name.find("$PID");
  if (at != std::string::npos) name.replace(at, 4, std::to_string(getpid()));
  sd_bus_request_name(bus, name.c_str(), 0);
}

void hear(const std::string& interface) {
  notes["hears"] = interface;
  sd_bus_add_match(bus, nullptr, ("type='signal',interface='" + interface + "'").c_str(), nullptr, nullptr);
}

void answerHeld() {
  for (sd_bus_message* call : held) {
    answer(call);
    sd_bus_message_unref(call);
  }
  held.clear();
  std::erase_if(notes, [](const auto& entry) { return entry.second == "holds"; });
}

void setProperty(const std::string& name, const std::string& value) {
  const std::size_t colon = name.find(':');
  Property& set = property(name.substr(0, colon));
  if (colon != std::string::npos) set.type = name.substr(colon + 1);
  set.value = set.type == "x" ? std::to_string(remote::parseTime(value).count() / 1000) : value;
}

using Value = const std::string&;

const std::map<std::string_view, std::function<void(Value)>> kWords{
    {"owns", own},
    {"drops", [](Value name) { sd_bus_release_name(bus, name.c_str()); }},
    {"playing", [](Value) { setStatus("Playing"); }},
    {"paused", [](Value) { setStatus("Paused"); }},
    {"stopped", [](Value) { setStatus("Stopped"); }},
    {"toggles", [](Value) { notes["toggles"] = ""; }},
    {"silent", [](Value) { notes["silent"] = ""; }},
    {"counts", [](Value) { notes["counts"] = ""; }},
    {"says", [](Value status) { notes["says"] = status; }},
    {"ignores", [](Value method) { notes[method] = "ignores"; }},
    {"refuses", [](Value method) { notes[method] = "refuses"; }},
    {"dies", [](Value method) { notes[method] = "dies"; }},
    {"holds", [](Value method) { notes[method] = "holds"; }},
    {"obeys", [](Value method) { notes.erase(method); }},
    {"hears", hear},
    {"answers", [](Value) { answerHeld(); }},
    {"windows", [](Value names) { notes["windows"] = names; }},
    {"channel", [](Value file) { listenForLines(std::string(std::getenv("XDG_RUNTIME_DIR")) + "/" + file); }},
};

void obeyWords(const std::string& line) {
  std::istringstream words(line);
  for (std::string word; words >> word;) {
    const std::size_t sign = std::min(word.find('='), word.size());
    const std::string name = word.substr(0, sign);
    const std::string value = word.substr(std::min(sign + 1, word.size()));
    const auto known = kWords.find(name);
    try {
      if (known != kWords.end()) {
        known->second(value);
      } else if (name.starts_with("win.") || name.starts_with("rc.")) {
        notes[name] = value;
      } else {
        setProperty(name, value);
      }
    } catch (const remote::UsageError&) {
      std::cout << "! " << word << std::endl;
    }
  }
}

// ---- The order of things

/// Takes in all that was sent over the bus before this, and has the bus pass on all that was sent from here.
/// The bus reads its clients in any order: only at the second round it has read them all.
void takeInBus() {
  for (int round = 0; round < 2; ++round) {
    sd_bus_call_method(bus, "org.freedesktop.DBus", "/org/freedesktop/DBus", "org.freedesktop.DBus", "GetId",
                       nullptr, nullptr, "");
    while (sd_bus_process(bus, nullptr) > 0) {
    }
  }
}

/// False once the input has ended.
bool takeLine() {
  char line[1024];
  const ssize_t size = read(STDIN_FILENO, line, sizeof line);
  if (size <= 0) return false;
  takeInBus();
  serveLines(talk);
  obeyWords(std::string(line, static_cast<std::size_t>(size)));
  takeInBus();
  std::cout << "done" << std::endl;
  return true;
}

}  // namespace

int main(int argc, char** argv) {
  const char* uniqueName = nullptr;
  if (sd_bus_open_user(&bus) < 0 || sd_bus_add_filter(bus, nullptr, onMessage, nullptr) < 0 ||
      sd_bus_get_unique_name(bus, &uniqueName) < 0) {
    std::cerr << "fake_player: there is no session bus\n";
    return 1;
  }
  for (int i = 1; i < argc; ++i) obeyWords(argv[i]);
  std::cout << "ready " << uniqueName << std::endl;
  for (bool goesOn = true; goesOn;) {
    while (sd_bus_process(bus, nullptr) > 0) {
    }
    sd_bus_flush(bus);
    pollfd sources[] = {
        {sd_bus_get_fd(bus), POLLIN, 0}, {STDIN_FILENO, POLLIN, 0}, {lineDescriptor(), POLLIN, 0}};
    poll(sources, std::size(sources), -1);
    if (sources[2].revents != 0) {
      // What was said over the bus before comes first.
      takeInBus();
      serveLines(talk);
    }
    if (sources[1].revents != 0) goesOn = takeLine();
  }
}
