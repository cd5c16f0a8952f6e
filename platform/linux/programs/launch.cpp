#include "platform/linux/programs/launch.h"

#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstdlib>
#include <map>
#include <string>
#include <vector>

#include "platform/linux/programs/entries.h"
#include "platform/linux/programs/table.h"
#include "platform/linux/system/bus.h"

namespace linux::programs {

namespace {

/// A program that has not appeared by then never will, and may be started again.
constexpr std::chrono::seconds kStartingLimit{20};

const system::Callee kServiceManager{"org.freedesktop.systemd1", 0};

/// What a program needs to find the session, given on where the service manager may not know it.
constexpr const char* kSessionVariables[] = {"DISPLAY", "XAUTHORITY", "WAYLAND_DISPLAY",
                                             "DBUS_SESSION_BUS_ADDRESS"};

const Entry* installed(const Program& program) {
  const Entry* const entry = entryByID(program.entry);
  return entry != nullptr && entry->role == program.role ? entry : nullptr;
}

/// A browser that has just been started has nothing to play.
bool canBeStarted(const Entry& entry) {
  const Program* const program = programByEntry(entry.id);
  const bool browser = program != nullptr && (program->quirks & players::kNeedsMedia) != 0;
  return (!browser || entry.cast) && (entry.busActivatable || !entry.command.empty());
}

/// "/org/example/Player" for "org.example.Player" (Desktop Entry Specification, D-Bus Activation).
std::string objectPath(const std::string& id) {
  std::string path = "/" + id;
  std::replace(path.begin(), path.end(), '.', '/');
  std::replace(path.begin(), path.end(), '-', '_');
  return path;
}

bool startOverBus(const Entry& entry) {
  if (!entry.busActivatable) return false;
  const std::string path = objectPath(entry.id);
  system::Message request =
      system::makeCall({entry.id, 0}, {path.c_str(), "org.freedesktop.Application", "Activate"});
  if (request == nullptr) return false;
  sd_bus_message_set_auto_start(request.get(), 1);
  return sd_bus_message_append(request.get(), "a{sv}", 0) >= 0 && system::send(std::move(request));
}

std::vector<std::string> sessionEnvironment() {
  std::vector<std::string> assignments;
  for (const char* variable : kSessionVariables) {
    if (const char* value = std::getenv(variable)) assignments.push_back(std::string(variable) + "=" + value);
  }
  return assignments;
}

std::vector<char*> pointers(const std::vector<std::string>& texts) {
  std::vector<char*> result(texts.size() + 1, nullptr);
  std::transform(texts.begin(), texts.end(), result.begin(), [](const std::string& text) {
    return const_cast<char*>(text.c_str());  // NOLINT(*-const-cast): execve changes none
  });
  return result;
}

/// Adds one property of a unit, (sv), with a list of texts as its value.
bool appendTexts(sd_bus_message* message, const char* property, const std::vector<std::string>& texts) {
  return sd_bus_message_open_container(message, 'r', "sv") >= 0 &&
         sd_bus_message_append(message, "s", property) >= 0 &&
         sd_bus_message_open_container(message, 'v', "as") >= 0 &&
         sd_bus_message_append_strv(message, pointers(texts).data()) >= 0 &&
         sd_bus_message_close_container(message) >= 0 && sd_bus_message_close_container(message) >= 0;
}

/// The service manager puts the environment's values for "$NAME" and "${NAME}", and "$" for "$$".
std::vector<std::string> escaped(std::vector<std::string> words) {
  for (std::string& word : words) {
    for (std::size_t at = 0; (at = word.find('$', at)) != std::string::npos; at += 2) word.insert(at, 1, '$');
  }
  return words;
}

/// Adds the property ExecStart, an array of one command: (sv) with v of a(sasb).
bool appendCommand(sd_bus_message* message, const std::vector<std::string>& command) {
  return sd_bus_message_open_container(message, 'r', "sv") >= 0 &&
         sd_bus_message_append(message, "s", "ExecStart") >= 0 &&
         sd_bus_message_open_container(message, 'v', "a(sasb)") >= 0 &&
         sd_bus_message_open_container(message, 'a', "(sasb)") >= 0 &&
         sd_bus_message_open_container(message, 'r', "sasb") >= 0 &&
         sd_bus_message_append(message, "s", command.front().c_str()) >= 0 &&
         sd_bus_message_append_strv(message, pointers(escaped(command)).data()) >= 0 &&
         sd_bus_message_append(message, "b", 0) >= 0 && sd_bus_message_close_container(message) >= 0 &&
         sd_bus_message_close_container(message) >= 0 && sd_bus_message_close_container(message) >= 0 &&
         sd_bus_message_close_container(message) >= 0;
}

/// A unit name of its own for every start (Desktop Environments with systemd:
/// app-LAUNCHER-ID-RANDOM.service).
std::string unitName(const Entry& entry) {
  std::string id;
  for (const char character : entry.id) {
    const bool plain =
        std::isalnum(static_cast<unsigned char>(character)) != 0 || character == '.' || character == '_';
    id += plain ? character : '_';
  }
  return "app-kvd-" + id + "-" + std::to_string(base::Clock::now().time_since_epoch().count()) + ".service";
}

/// As a transient unit of the service manager: outside our own unit, its confinement and its end.
bool startAsUnit(const Entry& entry) {
  if (!system::nameHasOwner(kServiceManager.name.c_str())) return false;
  system::Message request = system::makeCall(
      kServiceManager,
      {"/org/freedesktop/systemd1", "org.freedesktop.systemd1.Manager", "StartTransientUnit"});
  if (request == nullptr) return false;
  sd_bus_message* const message = request.get();
  const std::string directory = entry.directory.empty() ? "~" : entry.directory;
  const bool complete =
      sd_bus_message_append(message, "ss", unitName(entry).c_str(), "fail") >= 0 &&
      sd_bus_message_open_container(message, 'a', "(sv)") >= 0 &&
      sd_bus_message_append(message, "(sv)(sv)(sv)(sv)", "Description", "s", entry.id.c_str(), "Slice", "s",
                            "app.slice", "CollectMode", "s", "inactive-or-failed", "WorkingDirectory", "s",
                            directory.c_str()) >= 0 &&
      appendTexts(message, "Environment", sessionEnvironment()) && appendCommand(message, entry.command) &&
      sd_bus_message_close_container(message) >= 0 && sd_bus_message_append(message, "a(sa(sv))", 0) >= 0;
  return complete && system::call(kServiceManager, std::move(request), system::kCommandLimit) != nullptr;
}

[[noreturn]] void become(const Entry& entry) {
  setsid();
  sigset_t none;
  sigemptyset(&none);
  sigprocmask(SIG_SETMASK, &none, nullptr);
  std::signal(SIGPIPE, SIG_DFL);
  if (!entry.directory.empty() && chdir(entry.directory.c_str()) != 0) _exit(127);
  execvp(entry.command.front().c_str(), pointers(entry.command).data());
  _exit(127);
}

/// Without a service manager: as a grandchild, which init adopts at once.
void startDetached(const Entry& entry) {
  const pid_t child = fork();
  if (child == 0) {
    if (fork() == 0) become(entry);
    _exit(0);
  }
  while (child > 0 && waitpid(child, nullptr, 0) < 0 && errno == EINTR) {
  }
}

}  // namespace

const Entry* defaultProgramOf(Role role) {
  if (role == Role::Jukebox) {
    const Entry* const chosen = entryByID(defaultMusicPlayer());
    if (chosen != nullptr && canBeStarted(*chosen)) return chosen;
  }
  for (const Program& program : programs()) {
    const Entry* const entry = program.role == role ? installed(program) : nullptr;
    if (entry != nullptr && canBeStarted(*entry)) return entry;
  }
  const auto& all = entries();
  const auto any = std::find_if(
      all.begin(), all.end(), [&](const Entry& entry) { return entry.role == role && canBeStarted(entry); });
  return any != all.end() ? &*any : nullptr;
}

void launchProgramOf(Role role) {
  static std::map<Role, base::Deadline> sStarting;
  const auto starting = sStarting.find(role);
  if (starting != sStarting.end() && !starting->second.hasPassed()) return;
  const Entry* const entry = defaultProgramOf(role);
  if (entry == nullptr) return;
  sStarting.insert_or_assign(role, base::Deadline(kStartingLimit));
  if (startOverBus(*entry) || entry->command.empty() || startAsUnit(*entry)) return;
  startDetached(*entry);
}

}  // namespace linux::programs
