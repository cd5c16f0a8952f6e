#include "tests/linux/fake_session.h"

#include <sys/prctl.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <csignal>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <filesystem>
#include <fstream>
#include <list>
#include <sstream>
#include <utility>

#include "platform/host.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/system/process.h"
#include "platform/stage/four_char_code.h"
#include "registry/bridge.h"
#include "remote/words.h"
#include "tests/linux/fake_windows.h"

namespace fake {

namespace {

namespace files = std::filesystem;

/// A bus that starts nothing by itself.
constexpr const char* kBusConfiguration = R"(<busconfig>
<type>session</type><listen>unix:path=bus</listen><auth>EXTERNAL</auth>
<policy context="default"><allow send_destination="*"/><allow receive_sender="*"/><allow own="*"/></policy>
</busconfig>)";

struct Line {
  /// Of kvd's message on the bus that it tells of.
  std::uint64_t serial;
  std::string text;
};

files::path sDirectory;
Program sBus;
std::list<Program> sPrograms;
std::vector<Line> sJournal;

/// Starts a program in the directory, which ends with this process at the latest.
void start(Program& program, const std::vector<std::string>& command) {
  std::vector<char*> arguments;
  for (const std::string& word : command) arguments.push_back(const_cast<char*>(word.c_str()));
  arguments.push_back(nullptr);
  int ends[2];
  if (socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends) != 0) std::abort();
  program.process = fork();
  if (program.process < 0) std::abort();
  if (program.process == 0) {
    prctl(PR_SET_PDEATHSIG, SIGKILL);
    dup2(ends[1], STDIN_FILENO);
    dup2(ends[1], STDOUT_FILENO);
    if (chdir(sDirectory.c_str()) == 0) execvp(arguments.front(), arguments.data());
    _exit(127);
  }
  close(ends[1]);
  program.lines = fdopen(ends[0], "r");
}

/// The next line that it writes; "" when it has ended.
std::string readLine(Program& program) {
  char line[4096];
  if (std::fgets(line, sizeof line, program.lines) == nullptr) return {};
  return {line, std::string_view(line).find('\n')};
}

void bury(Program& program) {
  kill(program.process, SIGKILL);
  std::fclose(program.lines);
  waitpid(program.process, nullptr, 0);
  std::erase_if(screen().windows, [&](const auto& window) { return window.process == program.process; });
  screen().changed = true;
}

/// Takes in what a program tells until it is ready, or has done what it was told: that line, or "" when it
/// has ended instead.
std::string hear(Program& program) {
  const std::size_t before = sJournal.size();
  std::string line;
  std::string wrong;
  while (line = readLine(program), !line.empty() && line != "done" && !line.starts_with("ready ")) {
    if (line.starts_with("! ")) wrong = line;
    Line told{};
    std::string time;
    std::istringstream fields(line);
    std::getline(fields >> told.serial >> time >> std::ws, told.text);
    sJournal.push_back({told.serial, program.name + ": " + told.text});
  }
  if (!wrong.empty()) throw remote::UsageError("a program does not know the word" + wrong.substr(1));
  // What comes over a channel has no number: it stands as late as what the program got after it allows.
  std::uint64_t next = UINT64_MAX;
  for (std::size_t i = sJournal.size(); i-- > before;) {
    next = sJournal[i].serial != 0 ? sJournal[i].serial : next;
    sJournal[i].serial = next;
  }
  return line;
}

/// False when the program has ended, and what it told before has been heard.
bool say(Program& program, const std::string& words) {
  const std::string line = words + "\n";
  // No plain send(): a simulation may let kvd's own sends fail.
  const bool written = sendto(fileno(program.lines), line.data(), line.size(), MSG_NOSIGNAL, nullptr, 0) > 0;
  return !hear(program).empty() && written;
}

Program& find(std::string_view name) {
  const auto found = std::ranges::find(sPrograms, name, &Program::name);
  if (found == sPrograms.end()) throw remote::UsageError("no program is called " + remote::inQuotes(name));
  return *found;
}

/// Has the bus take in all that kvd has sent, and kvd all that was sent to it; as in fake_player.cpp.
void passOn() {
  for (int round = 0; round < 2; ++round) {
    linux::system::call({"org.freedesktop.DBus", 0},
                        {"/org/freedesktop/DBus", "org.freedesktop.DBus", "GetId"}, std::chrono::seconds(10),
                        "");
  }
}

/// What reaches a window finds its place among what goes over the bus by a message of its own.
void recordAtWindow(const std::string& text) {
  const std::string key = text.substr(0, text.rfind(' '));
  if (text.ends_with(" up") && !sJournal.empty() && sJournal.back().text == key + " down") {
    sJournal.back().text = key;
    return;
  }
  sd_bus_message* mark = nullptr;
  std::uint64_t serial = 0;
  sd_bus_message_new_signal(linux::system::bus(), &mark, "/fake", "fake.Order", "Mark");
  sd_bus_send(nullptr, mark, &serial);
  sd_bus_message_unref(mark);
  sJournal.push_back({serial, text});
}

/// Waits until a process that starts now has a later time than this one.
void passTick(pid_t process) {
  constexpr long kTick = 10'000'000;  // nanoseconds
  timespec now{};
  do {
    const timespec moment{0, kTick / 10};
    nanosleep(&moment, nullptr);
    clock_gettime(CLOCK_BOOTTIME, &now);
  } while (now.tv_sec * (1'000'000'000 / kTick) + now.tv_nsec / kTick <= linux::system::startTime(process));
}

}  // namespace

void beginSession() {
  std::string directory = files::temp_directory_path() / "kvd-session-XXXXXX";
  if (mkdtemp(directory.data()) == nullptr) std::abort();
  sDirectory = directory;
  files::create_directory(sDirectory / "applications");
  for (const char* variable :
       {"HOME", "XDG_RUNTIME_DIR", "XDG_DATA_HOME", "XDG_DATA_DIRS", "XDG_CONFIG_HOME", "XDG_CONFIG_DIRS"}) {
    setenv(variable, directory.c_str(), 1);
  }
  setenv("XDG_DATA_DIRS", (directory + "/none").c_str(), 1);
  for (const char* variable : {"DISPLAY", "WAYLAND_DISPLAY", "PULSE_SERVER"}) unsetenv(variable);
  setenv("DBUS_SESSION_BUS_ADDRESS", ("unix:path=" + directory + "/bus").c_str(), 1);
  std::ofstream(sDirectory / "bus.conf") << kBusConfiguration;
  start(sBus, {"sh", "-c",
               "exec dbus-daemon --config-file=bus.conf --nofork --nopidfile --print-address 2>/dev/null"});
  if (readLine(sBus).empty()) std::abort();
  screen().journal = recordAtWindow;
}

void endSession() {
  std::ranges::for_each(sPrograms, bury);
  sPrograms.clear();
  bury(sBus);
  files::remove_all(sDirectory);
}

void writeEntry(const std::string& id, const std::vector<std::string>& lines) {
  std::ofstream entry(sDirectory / "applications" / (id + ".desktop"));
  entry << "[Desktop Entry]\nType=Application\nName=" << id << "\nExec=true %U\n";
  for (const std::string& line : lines) entry << line << "\n";
}

void startProgram(const std::string& name, const std::string& executable, std::vector<std::string> words) {
  files::copy_file(files::read_symlink("/proc/self/exe").parent_path() / "fake_player",
                   sDirectory / executable, files::copy_options::skip_existing);
  if (!sPrograms.empty()) passTick(sPrograms.back().process);
  Program& child = sPrograms.emplace_back();
  child.name = name;
  words.insert(words.begin(), "./" + executable);
  start(child, words);
  child.uniqueName = hear(child).substr(std::string_view("ready ").size());
}

const Program& program(std::string_view name) { return find(name); }

void tellProgram(const std::string& name, const std::string& words) { say(find(name), words); }

void endProgram(const std::string& name) {
  bury(find(name));
  sPrograms.remove_if([&](const Program& each) { return each.name == name; });
}

void freeze(const std::string& name, bool stopped) {
  find(name).stopped = stopped;
  kill(find(name).process, stopped ? SIGSTOP : SIGCONT);
}

std::string runScript(const std::string& source) {
  HostGetApplicationListSeed(kHostDefaultSession);
  const HostDescriptorRef result = HandleScriptWithResult(source.c_str());
  if (!result) return "fails";
  const FourCharCode code = HostDescriptorTypeCodeValue(result);
  const std::string value =
      code != 0 ? stage::quoted(code) : std::to_string(HostDescriptorInt32Value(result));
  HostRelease(result);
  return "= " + value;
}

std::vector<std::string> takeJournal() {
  passOn();
  for (auto child = sPrograms.begin(); child != sPrograms.end();) {
    if (child->stopped || say(*child, "")) {
      ++child;
      continue;
    }
    sJournal.push_back({UINT64_MAX, child->name + ": gone"});
    bury(*child);
    child = sPrograms.erase(child);
  }
  passOn();
  std::ranges::stable_sort(sJournal, {}, &Line::serial);
  std::vector<std::string> texts;
  for (Line& line : std::exchange(sJournal, {})) texts.push_back(std::move(line.text));
  return texts;
}

}  // namespace fake
