#include "platform/linux/system/names.h"

#include <algorithm>
#include <charconv>
#include <cstdint>
#include <map>
#include <utility>
#include <vector>

#include "platform/linux/system/bus.h"
#include "platform/linux/system/bus_values.h"

namespace linux::system {

namespace {

const Callee kBusItself{"org.freedesktop.DBus", 0};
constexpr const char* kBusPath = "/org/freedesktop/DBus";
constexpr const char* kBusInterface = "org.freedesktop.DBus";

/// Buses let in some hundreds.
constexpr std::size_t kMostNames = 4096;

struct Process {
  std::optional<pid_t> id;
  Slot asking;
};

/// By unique name, of the connection to the bus that they are known from.
std::map<std::string, Process> sProcesses;
unsigned sGeneration = 0;

int takeProcess(sd_bus_message* answer, void* context, sd_bus_error*) {
  std::uint32_t process = 0;
  sd_bus_message_read(answer, "u", &process);
  static_cast<Process*>(context)->id = static_cast<pid_t>(process);
  return 0;
}

int takeChange(sd_bus_message* signal, void* context, sd_bus_error*) {
  const auto& follower = *static_cast<const NameFollower*>(context);
  const char* name = nullptr;
  const char* before = nullptr;
  const char* after = nullptr;
  if (sd_bus_message_read(signal, "sss", &name, &before, &after) <= 0) return 0;
  if (*after == '\0') sProcesses.erase(name);
  if (follower.wants(name)) follower.take(name, before, after);
  return 0;
}

std::string ownerOf(const std::string& name) {
  if (name.starts_with(':')) return name;
  const Message answer =
      call(kBusItself, {kBusPath, kBusInterface, "GetNameOwner"}, kQueryLimit, "s", name.c_str());
  const char* owner = nullptr;
  return answer != nullptr && sd_bus_message_read(answer.get(), "s", &owner) > 0 ? owner : "";
}

/// Connections are numbered as they come to the bus.
std::uint64_t numberOf(const std::string& uniqueName) {
  std::uint64_t number = 0;
  const std::size_t dot = uniqueName.rfind('.');
  if (dot != std::string::npos) {
    std::from_chars(uniqueName.data() + dot + 1, uniqueName.data() + uniqueName.size(), number);
  }
  return number;
}

/// Those that are there, with their owners; an empty one is not known.
std::optional<std::vector<std::pair<std::string, std::string>>> wantedNames(const NameFollower& follower) {
  std::vector<std::pair<std::string, std::string>> found;
  const Message answer = call(kBusItself, {kBusPath, kBusInterface, "ListNames"}, kQueryLimit, "");
  if (answer == nullptr || sd_bus_message_enter_container(answer.get(), SD_BUS_TYPE_ARRAY, "s") <= 0) {
    return std::nullopt;
  }
  while (const auto name = readText(answer.get(), "s")) {
    if (found.size() == kMostNames) break;
    if (follower.wants(*name)) found.emplace_back(*name, ownerOf(*name));
  }
  std::ranges::sort(found, {}, [](const auto& each) { return std::pair(numberOf(each.second), each.first); });
  return found;
}

}  // namespace

void followNames(const NameFollower& follower) {
  sd_bus_add_match_async(bus(), nullptr,
                         "type='signal',sender='org.freedesktop.DBus',interface='org.freedesktop.DBus',"
                         "member='NameOwnerChanged'",
                         takeChange, nullptr, const_cast<NameFollower*>(&follower));
}

bool tellNames(const NameFollower& follower) {
  const auto names = wantedNames(follower);
  if (!names) return false;
  bool toldAll = true;
  for (const auto& [name, owner] : *names) {
    if (owner.empty()) {
      toldAll = false;
    } else {
      follower.take(name, "", owner);
    }
  }
  return toldAll;
}

std::optional<pid_t> processOf(const std::string& uniqueName) {
  if (sGeneration != busGeneration()) sProcesses.clear();
  sGeneration = busGeneration();
  const auto [entry, isNew] = sProcesses.try_emplace(uniqueName);
  Process& process = entry->second;
  if (!isNew) return process.id;
  Message request = makeCall(kBusItself, {kBusPath, kBusInterface, "GetConnectionUnixProcessID"});
  if (request != nullptr && sd_bus_message_append(request.get(), "s", uniqueName.c_str()) >= 0) {
    process.asking = callLater(std::move(request), takeProcess, &process);
  }
  return process.id;
}

}  // namespace linux::system
