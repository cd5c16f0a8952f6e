#include "platform/linux/windows/kwin/script.h"

#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <nlohmann/json.hpp>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "platform/base/deadline.h"
#include "platform/base/file_descriptor.h"
#include "platform/base/run_loop.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/system/turn.h"
#include "platform/linux/windows/kwin/window_script.h"
#include "platform/linux/windows/wayland/outputs.h"

namespace linux::windows::kwin {

namespace {

using Json = nlohmann::json;

constexpr char kKWin[] = "org.kde.KWin";
constexpr char kPath[] = "/windows";
constexpr char kInterface[] = "com.tarn.kvd.Windows";
constexpr char kMember[] = "Tell";

/// Hundreds of windows are less than that.
constexpr std::size_t kLongestReport = 1 << 20;

struct Reported {
  std::string uuid;
  Window window;
};

/// Takes the script's calls, as long as there is a script on this connection to the bus.
system::Slot sObject;
unsigned sGeneration = 0;
/// KWin's unique name on the bus.
std::string sOwner;
bool sHasTold = false;
std::optional<std::uint64_t> sTried;

std::vector<Reported> sReported;
std::uint64_t sLastNumber = 0;
unsigned sChanges = 0;

/// The script's name, each program's its own.
std::string scriptName() { return program_invocation_short_name; }

template <typename... Arguments>
system::Message callScripting(const char* member, const char* types, Arguments... arguments) {
  return system::call({kKWin, 0}, {"/Scripting", "org.kde.kwin.Scripting", member}, system::kQueryLimit,
                      types, arguments...);
}

/// The window's number in the last report; a new one where it was not in it.
std::uint64_t numberOf(std::string_view uuid) {
  const auto known = std::ranges::find(sReported, uuid, &Reported::uuid);
  return known != sReported.end() ? known->window.id.number : ++sLastNumber;
}

Reported readWindow(const Json& told) {
  const std::string uuid = told.at("uuid").get<std::string>();
  Window window;
  window.id.number = numberOf(uuid);
  window.process = told.at("process").get<pid_t>();
  window.className = told.at("class").get<std::string>();
  window.instanceName = told.at("instance").get<std::string>();
  const auto entry = told.at("entry").get<std::string>();
  window.applicationID = entry.empty() ? window.className : entry;
  window.title = told.at("title").get<std::string>();
  window.isDialog = told.at("dialog").get<bool>();
  window.isActive = told.at("active").get<bool>();
  window.isShown = told.at("shown").get<bool>();
  window.isFullScreen = told.at("full").get<bool>() && window.isShown;
  if (window.isFullScreen) window.area = wayland::areaAt(told.at("x").get<int>(), told.at("y").get<int>());
  return {uuid, window};
}

void takeReport(std::string_view text) {
  std::vector<Reported> reported;
  try {
    for (const Json& told : Json::parse(text)) reported.push_back(readWindow(told));
  } catch (const Json::exception&) {
    return;
  }
  sReported = std::move(reported);
  sHasTold = true;
  ++sChanges;
}

int takeCall(sd_bus_message* message, void*, sd_bus_error*) {
  const char* const sender = sd_bus_message_get_sender(message);
  if (sd_bus_message_is_method_call(message, kInterface, kMember) <= 0 || sender == nullptr ||
      sender != sOwner) {
    return 0;
  }
  const char* text = nullptr;
  if (sd_bus_message_read(message, "s", &text) > 0 && std::string_view(text).size() <= kLongestReport) {
    takeReport(text);
  }
  return sd_bus_reply_method_return(message, "");
}

std::string ownerOfKWin() {
  const auto answer = system::call({"org.freedesktop.DBus", 0},
                                   {"/org/freedesktop/DBus", "org.freedesktop.DBus", "GetNameOwner"},
                                   system::kQueryLimit, "s", kKWin);
  const char* owner = nullptr;
  if (answer == nullptr || sd_bus_message_read(answer.get(), "s", &owner) <= 0) return {};
  return owner;
}

/// The script with its first line, which says whom to tell.
std::string scriptFor(std::string_view name) {
  std::string script = "function tell(windows) { callDBus(\"";
  script.append(name).append("\", \"").append(kPath).append("\", \"").append(kInterface).append("\", \"");
  return script.append(kMember).append("\", windows); }\n").append(kWindowScript);
}

/// Has KWin read and run it. False when it does not.
bool runScript(const base::FileDescriptor& file) {
  const std::string path = "/proc/" + std::to_string(getpid()) + "/fd/" + std::to_string(file.get());
  const std::string name = scriptName();
  // One of the name may be left of a program that did not come to its end.
  callScripting("unloadScript", "s", name.c_str());
  const auto loaded = callScripting("loadScript", "ss", path.c_str(), name.c_str());
  int number = -1;
  return loaded != nullptr && sd_bus_message_read(loaded.get(), "i", &number) > 0 && number >= 0 &&
         callScripting("start", "") != nullptr;
}

void load() {
  const char* self = nullptr;
  sd_bus_slot* object = nullptr;
  sOwner = ownerOfKWin();
  if (sOwner.empty() || sd_bus_get_unique_name(system::bus(), &self) < 0 ||
      sd_bus_add_object(system::bus(), &object, kPath, takeCall, nullptr) < 0) {
    return;
  }
  sObject.reset(object);
  sGeneration = system::busGeneration();
  const base::FileDescriptor file(memfd_create("windows", MFD_CLOEXEC));
  const system::Limit limit = system::patience(system::kQueryLimit);
  const base::Deadline deadline(limit);
  if (base::writeAll(file, scriptFor(self)) && runScript(file)) {
    while (!sHasTold && system::waitForBus(deadline)) system::takeInBus();
  }
  if (sHasTold) return;
  if (deadline.hasPassed()) system::noteWaitInVain(limit);
  closeScript();
}

}  // namespace

bool openScript() {
  if (sObject != nullptr && sGeneration != system::busGeneration()) closeScript();
  if (sObject == nullptr && sTried != base::turn()) {
    sTried = base::turn();
    load();
  }
  return sHasTold;
}

void closeScript() {
  if (sObject == nullptr) return;
  system::send({kKWin, 0}, {"/Scripting", "org.kde.kwin.Scripting", "unloadScript"}, "s",
               scriptName().c_str());
  sObject.reset();
  sHasTold = false;
  sReported.clear();
  ++sChanges;
}

const Source kScript{
    .changes = [] { return sChanges; },
    .windows =
        [] {
          std::vector<Window> windows;
          for (const Reported& each : sReported) windows.push_back(each.window);
          return windows;
        },
    .activate =
        [](std::uint64_t window) {
          const auto known =
              std::ranges::find(sReported, window, [](const auto& each) { return each.window.id.number; });
          if (known == sReported.end()) return;
          // What KWin offers to launchers: the first action for a window is to activate it.
          system::send({kKWin, 0}, {"/WindowsRunner", "org.kde.krunner1", "Run"}, "ss",
                       ("0_" + known->uuid).c_str(), "");
        },
};

}  // namespace linux::windows::kwin
