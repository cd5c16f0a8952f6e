#include "platform/linux/running.h"

#include <algorithm>
#include <fstream>
#include <functional>
#include <iterator>
#include <sstream>
#include <string_view>

#include "platform/linux/casting.h"
#include "platform/tarnscript/tarnscript.h"
#include "platform/text/case.h"

namespace desktop {

namespace {

std::vector<Instance> sInstances;
std::uint32_t sSeed = 1;

/// When a process started, in ticks since the machine did (field 22 of /proc/PID/stat); 0 where it cannot be
/// read.
std::uint32_t startTime(pid_t process) {
  constexpr int kFieldsBefore =
      19;  // between the name, which may hold anything but ends with the last ')', and it
  std::ifstream file("/proc/" + std::to_string(process) + "/stat");
  const std::string text(std::istreambuf_iterator<char>(file), {});
  const std::size_t end = text.rfind(')');
  if (end == std::string::npos) return 0;
  std::istringstream rest(text.substr(end + 1));
  std::string field;
  for (int i = 0; i < kFieldsBefore; ++i) rest >> field;
  std::uint64_t ticks = 0;
  rest >> ticks;
  return static_cast<std::uint32_t>(ticks);
}

bool belongsTo(const Client& client, const Instance& instance) {
  return client.process != 0 && client.process == instance.process;
}

bool hasWindow(const Instance& instance, Window window) {
  return std::find(instance.windows.begin(), instance.windows.end(), window) != instance.windows.end();
}

void addPlayers(std::vector<Instance>& found) {
  for (const Player& player : players()) {
    Casting casting = castPlayer(player.desktopEntry, player.name);
    if (casting.role == Role::None) continue;
    Instance instance;
    instance.role = casting.role;
    instance.program = casting.program;
    instance.entry = std::move(casting.entry);
    instance.process = player.callee.process;
    instance.owner = player.callee.name;
    found.push_back(std::move(instance));
  }
}

/// The player that a window belongs to although its process has another number: a sandboxed program speaks on
/// the bus through a proxy.
Instance* sandboxedPlayer(std::vector<Instance>& found, const Casting& casting) {
  const auto fits = [&](const Instance& instance) {
    if (instance.owner.empty() || instance.entry.empty() || instance.entry != casting.entry) return false;
    return std::none_of(clients().begin(), clients().end(),
                        [&](const Client& client) { return belongsTo(client, instance); });
  };
  const auto player = std::find_if(found.begin(), found.end(), fits);
  return player != found.end() ? &*player : nullptr;
}

/// Makes sure that every program with a window in a role is there.
void addPrograms(std::vector<Instance>& found) {
  for (const Client& client : clients()) {
    const auto known = std::any_of(found.begin(), found.end(),
                                   [&](const Instance& instance) { return belongsTo(client, instance); });
    if (known) continue;
    const Casting casting = castWindow(client.applicationID, client.instanceName, client.className);
    if (casting.role == Role::None) continue;
    if (Instance* const player = sandboxedPlayer(found, casting)) {
      player->process = client.process;
      continue;
    }
    Instance instance;
    instance.role = casting.role;
    instance.program = casting.program;
    instance.entry = casting.entry;
    instance.process = client.process;
    if (client.process == 0) instance.windows.push_back(client.window);
    found.push_back(std::move(instance));
  }
}

/// An office shows the documents of all its programs from one process: letters and sheets are not slides.
bool showsOtherDocument(const Client& client, const Instance& instance) {
  constexpr std::string_view kOffice = "libreoffice-";
  return instance.program != nullptr && client.className.starts_with(kOffice) &&
         !text::equalIgnoringCase(client.className, instance.program->windowClass);
}

/// What tells a program apart whose process nobody knows.
std::uint32_t numberWithoutProcess(const Instance& instance) {
  if (!instance.windows.empty()) return instance.windows.front();
  return static_cast<std::uint32_t>(std::hash<std::string>()(instance.owner));
}

void addWindows(std::vector<Instance>& found) {
  for (Instance& instance : found) {
    for (const Client& client : clients()) {
      if (belongsTo(client, instance) && !showsOtherDocument(client, instance)) {
        instance.windows.push_back(client.window);
      }
    }
    instance.serialNumber.low = static_cast<std::uint32_t>(instance.process);
    instance.serialNumber.high =
        instance.process != 0 ? startTime(instance.process) : numberWithoutProcess(instance);
  }
}

bool sameList(const std::vector<Instance>& a, const std::vector<Instance>& b) {
  return std::is_permutation(
      a.begin(), a.end(), b.begin(), b.end(), [](const Instance& x, const Instance& y) {
        return x.role == y.role && x.serialNumber == y.serialNumber && x.owner == y.owner;
      });
}

bool plays(const Instance& instance) {
  Player* const player = playerOf(instance);
  if (player == nullptr) return false;
  try {
    return statusOf(*player) == PlaybackStatus::Playing;
  } catch (const tarnscript::Refusal&) {
    return false;
  }
}

}  // namespace

void takeInDesktop() {
  const bool playersChanged = takeInPlayers();
  const bool windowsChanged = takeInX();
  if (!playersChanged && !windowsChanged) return;
  std::vector<Instance> found;
  addPlayers(found);
  addPrograms(found);
  addWindows(found);
  if (!sameList(found, sInstances)) ++sSeed;
  sInstances = std::move(found);
}

std::uint32_t applicationListSeed() { return sSeed; }

const std::vector<Instance>& instances() { return sInstances; }

std::vector<const Instance*> instancesOf(Role role) {
  struct Rank {
    bool inFront;
    bool plays;
    std::uint32_t started;
    const Instance* instance;
  };
  std::vector<Rank> ranks;
  for (const Instance& instance : sInstances) {
    if (instance.role == role) ranks.push_back({false, false, instance.serialNumber.high, &instance});
  }
  // Who plays may have to be asked for: only where there is something to choose.
  if (ranks.size() > 1) {
    for (Rank& rank : ranks) {
      rank.plays = plays(*rank.instance);
      rank.inFront = rank.instance == frontInstance();
    }
    std::stable_sort(ranks.begin(), ranks.end(), [](const Rank& a, const Rank& b) {
      if (a.inFront != b.inFront) return a.inFront;
      if (a.plays != b.plays) return a.plays;
      return a.started > b.started;
    });
  }
  std::vector<const Instance*> ordered(ranks.size());
  std::transform(ranks.begin(), ranks.end(), ordered.begin(), [](const Rank& rank) { return rank.instance; });
  return ordered;
}

const Instance* firstInstance(Role role) {
  const auto ordered = instancesOf(role);
  return ordered.empty() ? nullptr : ordered.front();
}

const Instance* findInstance(const HostProcessSerialNumber& serialNumber) {
  const auto found = std::find_if(sInstances.begin(), sInstances.end(), [&](const Instance& instance) {
    return instance.serialNumber == serialNumber;
  });
  return found != sInstances.end() ? &*found : nullptr;
}

const Instance* frontInstance() {
  const Window front = activeWindow();
  if (front == 0) return nullptr;
  const auto found = std::find_if(sInstances.begin(), sInstances.end(),
                                  [&](const Instance& instance) { return hasWindow(instance, front); });
  return found != sInstances.end() ? &*found : nullptr;
}

Player* playerOf(const Instance& instance) {
  if (instance.owner.empty()) return nullptr;
  for (Player& player : players()) {
    if (player.callee.name == instance.owner) return &player;
  }
  return nullptr;
}

void bringToFront(const Instance& instance) {
  if (!instance.windows.empty()) return activate(instance.windows.front());
  Player* const player = playerOf(instance);
  if (player == nullptr) return;
  try {
    raise(*player);
  } catch (const tarnscript::Refusal&) {
    // A player that cannot be raised stays where it is.
  }
}

}  // namespace desktop
