#include "platform/linux/windows/kwin/reports.h"

#include <algorithm>
#include <nlohmann/json.hpp>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "platform/base/deadline.h"
#include "platform/base/run_loop.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/system/turn.h"
#include "platform/linux/windows/kwin/script_texts.h"
#include "platform/linux/windows/kwin/scripting.h"
#include "platform/linux/windows/wayland/outputs.h"

namespace linux::windows::kwin {

namespace {

using Json = nlohmann::json;

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
RunningScript sScript;
/// What was last asked of KWin beside that.
RunningScript sErrand;
unsigned sGeneration = 0;
/// KWin's unique name on the bus.
std::string sOwner;
bool sHasTold = false;
std::optional<std::uint64_t> sTried;

std::vector<Reported> sReported;
std::uint64_t sLastNumber = 0;
unsigned sChanges = 0;

/// The window's number in the last report; a new one where it was not in it.
std::uint64_t numberOf(std::string_view uuid) {
  const auto known = std::ranges::find(sReported, uuid, &Reported::uuid);
  return known != sReported.end() ? known->window.id.number : ++sLastNumber;
}

/// A whole number; throws, as at() does, where something else is told.
int numberIn(const Json& told, const char* member) {
  return static_cast<int>(told.at(member).get_ref<const std::int64_t&>());
}

Reported readWindow(const Json& told) {
  const std::string uuid = told.at("uuid").get<std::string>();
  Window window;
  window.id.number = numberOf(uuid);
  window.process = numberIn(told, "process");
  window.className = told.at("class").get<std::string>();
  window.instanceName = told.at("instance").get<std::string>();
  const auto entry = told.at("entry").get<std::string>();
  window.applicationID = entry.empty() ? window.className : entry;
  window.title = told.at("title").get<std::string>();
  window.isDialog = told.at("dialog").get<bool>();
  window.isActive = told.at("active").get<bool>();
  window.isShown = told.at("shown").get<bool>();
  window.isFullScreen = told.at("full").get<bool>() && window.isShown;
  if (window.isFullScreen) window.area = wayland::areaAt(numberIn(told, "x"), numberIn(told, "y"));
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
                                   system::kQueryLimit, "s", kKWinName);
  const char* owner = nullptr;
  if (answer == nullptr || sd_bus_message_read(answer.get(), "s", &owner) <= 0) return {};
  return owner;
}

/// The script with its first line, which says whom to tell.
std::string scriptFor(std::string_view name) {
  std::string script = "function tell(windows) { callDBus(\"";
  script.append(name).append("\", \"").append(kPath).append("\", \"").append(kInterface).append("\", \"");
  return script.append(kMember).append("\", windows); }\n").append(kReportScript);
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
  const std::string name = scriptName("reports");
  unloadLeftover(name);
  sScript = RunningScript(name, scriptFor(self));
  const system::Limit limit = system::patience(system::kQueryLimit);
  const base::Deadline deadline(limit);
  while (!sHasTold && system::waitForBus(deadline)) system::takeInBus();
  if (sHasTold) return;
  if (deadline.hasPassed()) system::noteWaitInVain(limit);
  closeReports();
}

void activate(std::uint64_t number) {
  const auto found =
      std::ranges::find(sReported, number, [](const Reported& each) { return each.window.id.number; });
  if (found == sReported.end()) return;
  static unsigned errands = 0;
  const std::string name = scriptName("errand-" + std::to_string(++errands));
  sErrand = RunningScript(name, "const uuid = " + Json(found->uuid).dump() + ";" + kActivateScript);
}

}  // namespace

bool openReports() {
  if (sObject != nullptr && sGeneration != system::busGeneration()) closeReports();
  if (sObject == nullptr && sTried != base::turn()) {
    sTried = base::turn();
    load();
  }
  return sHasTold;
}

void closeReports() {
  sErrand = {};
  sScript = {};
  sObject.reset();
  sHasTold = false;
  sReported.clear();
  ++sChanges;
}

const Source kReports{
    .changes = [] { return sChanges; },
    .windows =
        [] {
          std::vector<Window> windows;
          windows.reserve(sReported.size());
          for (const Reported& each : sReported) windows.push_back(each.window);
          return windows;
        },
    .activate = activate,
};

}  // namespace linux::windows::kwin
