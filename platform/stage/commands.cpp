#include "platform/stage/commands.h"

#include <sys/socket.h>

#include <algorithm>
#include <cctype>
#include <span>
#include <string>
#include <type_traits>
#include <vector>

#include "messages/kvd_messages.h"
#include "platform/base/service_directory.h"
#include "platform/base/sockets.h"
#include "platform/mach.h"
#include "platform/stage/desktop.h"
#include "platform/stage/director.h"
#include "platform/stage/live.h"
#include "platform/stage/report.h"
#include "platform/stage/script_world.h"
#include "platform/stage/spindle.h"
#include "platform/stage/transcript.h"
#include "remote/buttons.h"
#include "remote/kvd_client.h"
#include "remote/words.h"

namespace stage {

namespace {

using remote::inQuotes;
using remote::UsageError;

/// The words behind a command's name, and the whole line.
struct Words {
  std::vector<std::string> list;
  std::string_view text;

  const std::string& at(std::size_t index) const { return list.at(index); }
  std::size_t size() const { return list.size(); }
};

struct Command {
  std::string_view name;
  std::string_view arguments;  ///< for people
  std::string_view help;
  std::size_t fewest;  ///< how many words it takes
  std::size_t most;
  bool needsDaemon;
  void (*run)(const Words& words);
};

constexpr std::size_t kAnyNumber = static_cast<std::size_t>(-1);

constexpr std::string_view kBlanks = " \t\r";

// ---- Messages ----

/// Sends with one of the client stubs, and says so where that failed.
template <typename... Fields>
void send(mach_msg_return_t (*stub)(mach_port_t, Fields...), std::type_identity_t<Fields>... fields) {
  mach_port_t bootstrap = MACH_PORT_NULL;
  mach_port_t port = MACH_PORT_NULL;
  kern_return_t result = task_get_special_port(mach_task_self(), TASK_BOOTSTRAP_PORT, &bootstrap);
  if (daemonHasEnded()) result = BOOTSTRAP_UNKNOWN_SERVICE;
  if (result == KERN_SUCCESS) result = bootstrap_look_up(bootstrap, kKVDServiceName, &port);
  if (result == KERN_SUCCESS) result = stub(port, fields...);
  if (result == MACH_SEND_TIMED_OUT) {
    say("the daemon's queue stays full");
  } else if (result != KERN_SUCCESS) {
    say("nobody is listening");
  }
}

void sendButton(const remote::Button& pressed, std::int32_t value) {
  send(kvd_handlehidevent, pressed.usagePage, pressed.usage, 0, value);
}

void tap(const Words& words) {
  const remote::Button& tapped = remote::knownButton(words.at(0));
  for (const std::int32_t value : remote::tapValues(tapped)) sendButton(tapped, value);
}

void press(const Words& words) { sendButton(remote::knownButton(words.at(0)), remote::kPressed); }

void release(const Words& words) { sendButton(remote::knownButton(words.at(0)), remote::kReleased); }

void hold(const Words& words) {
  const remote::Button& held = remote::knownButton(words.at(0));
  const auto time = remote::parseTime(words.at(1));
  sendButton(held, remote::kPressed);
  keep("press " + std::string(held.name));
  waitThen(time.count(), [&held] {
    sendButton(held, remote::kReleased);
    keep("release " + std::string(held.name));
  });
}

void raw(const Words& words) {
  const auto page = remote::parseNumber<std::uint16_t>("a usage page", words.at(0));
  const auto usage = remote::parseNumber<std::uint16_t>("a usage", words.at(1));
  const auto value = remote::parseNumber<std::int32_t>("a value", words.at(2));
  const auto extra = words.size() > 3 ? remote::parseNumber<std::uint16_t>("an extra value", words.at(3)) : 0;
  send(kvd_handlehidevent, page, usage, static_cast<std::uint16_t>(extra), value);
}

/// Bytes from anybody who can reach the socket, whatever they mean.
void datagram(const Words& words) {
  const std::string& digits = words.at(0);
  std::string bytes;
  for (std::size_t i = 0; i < digits.size(); i += 2) {
    const std::string pair = digits.substr(i, 2);
    const auto isDigit = [](char c) { return std::isxdigit(static_cast<unsigned char>(c)) != 0; };
    if (pair.size() != 2 || !std::ranges::all_of(pair, isDigit)) {
      throw UsageError("bytes are pairs of hexadecimal digits, not " + inQuotes(digits));
    }
    bytes += static_cast<char>(std::stoi(pair, nullptr, 16));
  }
  const auto directory = base::serviceDirectory(base::Side::Sends);
  const auto address = directory ? base::serviceAddress(*directory, kKVDServiceName) : std::nullopt;
  const base::FileDescriptor socket = address ? base::connectedSocket(*address) : base::FileDescriptor();
  if (::send(socket.get(), bytes.data(), bytes.size(), MSG_NOSIGNAL) < 0) say("nobody is listening");
}

bool onOrOff(const std::string& word) {
  if (word == "on") return true;
  if (word == "off") return false;
  throw UsageError("say on or off, not " + inQuotes(word));
}

void lock(const Words& words) { send(kvd_setscreenlocked, onOrOff(words.at(0)) ? 1 : 0); }

void quitDaemon(const Words&) { terminateDaemon(); }

// ---- The desktop ----

Application& installed(const std::string& name) {
  Application* const found = findApplication(name);
  if (found == nullptr) throw UsageError("no application is called " + inQuotes(name));
  return *found;
}

Application& running(const std::string& name) {
  Application& found = installed(name);
  if (!found.running()) throw UsageError(found.name + " does not run");
  return found;
}

void open(const Words& words) {
  Application* const found = findOrInstallApplication(words.at(0));
  if (found == nullptr) throw UsageError("no application is called " + inQuotes(words.at(0)));
  const bool again = words.size() > 1;
  if (again && words.at(1) != "again")
    throw UsageError("only 'again' can follow, not " + inQuotes(words.at(1)));
  if (found->running() && !again)
    throw UsageError(found->name + " runs already; 'again' starts it once more");
  openApplication(*found);
}

void close(const Words& words) { quitApplication(running(words.at(0))); }

void front(const Words& words) {
  if (words.at(0) == "nobody") return clearFront();
  bringToFront(running(words.at(0)));
}

void hang(const Words& words) {
  Application& hung = running(words.at(0));
  hung.hangsUntil = now() + remote::parseTime(words.at(1)).count();
}

void tell(const Words& words) {
  Application& told = installed(words.at(0));
  const std::size_t to = words.text.find(" to ");
  if (to == std::string_view::npos || words.at(1) != "to") {
    throw UsageError("say: tell " + words.at(0) + " to …");
  }
  const std::string statement(words.text.substr(to));
  const tarnscript::Outcome outcome =
      runScript("tell application id \"" + told.identifier + "\"" + statement);
  if (outcome.error) throw UsageError(outcome.error->message);
  const std::string answer = describe(outcome.value);
  if (!answer.empty()) say("= " + answer);
}

void volume(const Words& words) {
  const int wanted = remote::parseNumber<std::int32_t>("an output volume", words.at(0));
  if (wanted < 0 || wanted > 100) throw UsageError("an output volume is 0 to 100, not " + words.at(0));
  setOutputVolume(wanted);
}

void mute(const Words& words) { setOutputMuted(onOrOff(words.at(0))); }

struct Part {
  std::string_view name;
  bool Broken::*flag;
};

constexpr Part kParts[] = {
    {"window-server", &Broken::windowServer},
    {"display-query", &Broken::displayQuery},
    {"process-lookup", &Broken::processLookUp},
    {"event-records", &Broken::eventRecords},
};

void setBroken(const std::string& name, bool broken) {
  for (const Part& part : kParts) {
    if (part.name == name) {
      desktop().broken.*part.flag = broken;
      return;
    }
  }
  throw UsageError("window-server, display-query, process-lookup or event-records can break, not " +
                   inQuotes(name));
}

void breakPart(const Words& words) { setBroken(words.at(0), true); }

void mendPart(const Words& words) { setBroken(words.at(0), false); }

void answers(const Words& words) {
  Application& application = installed(words.at(0));
  if (words.at(1) == "normally") {
    application.manner = Manner::Obeys;
  } else if (words.at(1) == "nothing") {
    application.manner = Manner::Ignores;
  } else if (words.at(1) == "errors") {
    application.manner = Manner::Refuses;
  } else {
    throw UsageError("an application answers normally, nothing or errors, not " + inQuotes(words.at(1)));
  }
}

void version(const Words& words) {
  Application& application = installed(words.at(0));
  application.version = words.at(1) == "none" ? "" : words.at(1);
}

void disc(const Words& words) {
  if (words.at(0) != "in" && words.at(0) != "out")
    throw UsageError("a disc goes in or out, not " + inQuotes(words.at(0)));
  for (const auto& application : desktop().installed) {
    if (auto* const player = dynamic_cast<Spindle*>(application.get())) player->setDisc(words.at(0) == "in");
  }
}

void displays(const Words& words) {
  constexpr int kMost = 64;
  const int count = remote::parseNumber<std::uint8_t>("a number of displays", words.at(0));
  if (count > kMost) throw UsageError("there can be 0 to 64 displays, not " + words.at(0));
  desktop().displays.resize(static_cast<std::size_t>(count));
  for (std::size_t i = 0; i < desktop().displays.size(); ++i) {
    desktop().displays[i].id = static_cast<HostDisplayID>(i + 1);
  }
}

void capture(const Words& words) {
  const auto number = remote::parseNumber<std::uint8_t>("a display", words.at(0));
  if (number < 1 || number > desktop().displays.size())
    throw UsageError("there is no display " + words.at(0));
  desktop().displays[number - 1U].capturedByHand = onOrOff(words.at(1));
}

void show(const Words&) {
  for (const Process& process : desktop().running) {
    const bool isFront = desktop().front && desktop().front->application == process.application;
    const std::string state = process.application->describe();
    say(process.application->name + (isFront ? " (in front)" : "") + (state.empty() ? "" : ": " + state));
  }
  say("output volume " + std::to_string(desktop().outputVolume) + (desktop().outputMuted ? ", muted" : ""));
}

// ---- The rehearsal ----

void wait(const Words& words) { waitThen(remote::parseTime(words.at(0)).count(), nullptr); }

void start(const Words&) {}

void serveOthers(const Words&) { serve(); }

void save(const Words& words) { saveRehearsal(words.at(0)); }

void alive(const Words&) { say("alive: " + aliveText()); }

void help(const Words&);

// clang-format off
constexpr Command kCommands[] = {
    {"tap", "BUTTON", "what a remote sends for a short press", 1, 1, true, tap},
    {"press", "BUTTON", "the press alone", 1, 1, true, press},
    {"release", "BUTTON", "the release alone", 1, 1, true, release},
    {"hold", "BUTTON TIME", "press, wait, release", 2, 2, true, hold},
    {"raw", "PAGE USAGE VALUE [EXTRA]", "a button message by its numbers", 3, 4, true, raw},
    {"datagram", "BYTES", "any bytes for the service port, in hexadecimal", 1, 1, true, datagram},
    {"lock", "on|off", "lock or unlock the screen", 1, 1, true, lock},
    {"quit", "", "ask the daemon to end", 0, 0, true, quitDaemon},
    {"open", "APP [again]", "start an application; any identifier with dots is one", 1, 2, false, open},
    {"close", "APP", "end an application's oldest instance", 1, 1, false, close},
    {"front", "APP|nobody", "bring an application to the front", 1, 1, false, front},
    {"hang", "APP TIME", "let an application answer nobody for a time", 2, 2, false, hang},
    {"tell", "APP to STATEMENT", "script an application yourself", 3, kAnyNumber, false, tell},
    {"volume", "0…100", "set the output volume", 1, 1, false, volume},
    {"mute", "on|off", "mute the output", 1, 1, false, mute},
    {"answers", "APP normally|nothing|errors", "how an application treats scripts", 2, 2, false, answers},
    {"version", "APP TEXT|none", "an application's version", 2, 2, false, version},
    {"disc", "in|out", "the disc player's disc", 1, 1, false, disc},
    {"displays", "N", "how many displays there are", 1, 1, false, displays},
    {"capture", "N on|off", "whether a display is captured", 2, 2, false, capture},
    {"break", "PART", "window-server, display-query, process-lookup, event-records", 1, 1, false, breakPart},
    {"mend", "PART", "the same part works again", 1, 1, false, mendPart},
    {"show", "", "what runs, and how loud it is", 0, 0, false, show},
    {"wait", "TIME", "let time pass (2h, 10m, 1.5s, 20ms)", 1, 1, true, wait},
    {"start", "", "start the daemon, which else starts by itself", 0, 0, true, start},
    {"serve", "", "answer other processes until the daemon ends", 0, 0, true, serveOthers},
    {"save", "FILE", "write what was done so far as a transcript", 1, 1, false, save},
    {"alive", "", "count the host objects that are alive", 0, 0, false, alive},
    {"help", "", "this list", 0, 0, false, help},
};
// clang-format on

void help(const Words&) {
  for (const Command& command : kCommands) {
    std::string left = std::string(command.name) + " " + std::string(command.arguments);
    left.resize(std::max<std::size_t>(left.size(), 32), ' ');
    say(left + std::string(command.help));
  }
}

/// Those of which nothing is kept, or something else: what they do to time is kept by the clock.
constexpr std::string_view kNotKept[] = {"hold", "wait", "serve", "save", "help"};

/// Keeps a line without the blanks at its ends: one that begins with a blank is no command to a transcript.
void keepLine(std::string_view line) {
  const std::size_t begin = line.find_first_not_of(kBlanks);
  if (begin == std::string_view::npos) return;
  keep(std::string(line.substr(begin, line.find_last_not_of(kBlanks) + 1 - begin)));
}

const Command* findCommand(std::string_view name) {
  const auto* const found = std::find_if(std::begin(kCommands), std::end(kCommands),
                                         [&](const Command& command) { return command.name == name; });
  return found != std::end(kCommands) ? found : nullptr;
}

Words split(std::string_view line) {
  Words words;
  for (std::size_t start = line.find_first_not_of(kBlanks); start != std::string_view::npos;) {
    const std::size_t end = std::min(line.find_first_of(kBlanks, start), line.size());
    words.list.emplace_back(line.substr(start, end - start));
    start = line.find_first_not_of(kBlanks, end);
  }
  return words;
}

bool isComment(std::string_view line) {
  const std::size_t start = line.find_first_not_of(kBlanks);
  return start == std::string_view::npos || line[start] == '#';
}

}  // namespace

std::optional<std::string> runCommand(std::string_view line) {
  if (isComment(line)) {
    keepLine(line);
    return std::nullopt;
  }
  Words words = split(line);
  words.text = line;
  const std::string name = words.at(0);
  words.list.erase(words.list.begin());
  const Command* const command = findCommand(name);
  if (command == nullptr) return "unknown command " + inQuotes(name);
  if (words.size() < command->fewest || words.size() > command->most) {
    return "usage: " + name + " " + std::string(command->arguments);
  }
  try {
    command->run(words);
    if (std::ranges::find(kNotKept, command->name) == std::end(kNotKept)) keepLine(line);
    return std::nullopt;
  } catch (const UsageError& error) {
    return error.what();
  }
}

bool needsDaemon(std::string_view line) {
  if (isComment(line)) return false;
  const Words words = split(line);
  const Command* const command = findCommand(words.at(0));
  return command != nullptr && command->needsDaemon;
}

void terminateDaemon() { send(kvd_terminate); }

}  // namespace stage
