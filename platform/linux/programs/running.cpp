#include "platform/linux/programs/running.h"

#include <algorithm>
#include <functional>
#include <map>
#include <set>
#include <span>
#include <string_view>
#include <tuple>
#include <utility>

#include "platform/base/run_loop.h"
#include "platform/linux/players/mpris.h"
#include "platform/linux/programs/connections.h"
#include "platform/linux/system/process.h"
#include "platform/tarnscript/tarnscript.h"
#include "platform/text/case.h"

namespace linux::programs {

namespace {

using players::Player;
using windows::Window;

std::vector<Instance> sInstances;
std::uint32_t sSeed = 1;

/// The windows as they were cast: those of a suite with their class as it was then.
std::vector<Window> sWindows;
/// The turn in which those classes were last looked at.
std::optional<std::uint64_t> sClassesRead;

/// Who was found to be first for a role, and in which turn.
std::map<Role, HostProcessSerialNumber> sFirst;
std::uint64_t sFirstFoundIn = 0;

bool belongsTo(const Window& window, const Instance& instance) {
  return window.process != 0 && window.process == instance.process;
}

bool anyBelongsTo(const Instance& instance) {
  return std::ranges::any_of(sWindows, [&](const Window& window) { return belongsTo(window, instance); });
}

/// A suite shows the documents of all its programs from one process: letters and sheets are not slides.
bool showsOtherDocument(const Window& window, const Instance& instance) {
  const Program* const program = instance.program;
  return program != nullptr && *program->suite != '\0' && window.className.starts_with(program->suite) &&
         !text::equalIgnoringCase(window.className, program->windowClass);
}

Instance instanceOf(Casting casting) {
  Instance instance;
  instance.role = casting.role;
  instance.program = casting.program;
  instance.ground = casting.ground;
  instance.entry = std::move(casting.entry);
  return instance;
}

void addPlayers(std::vector<Instance>& found) {
  for (Player& player : players::list()) {
    const Program* known = programByBusName(player.name);
    if (known == nullptr) known = programByEntry(player.desktopEntry);
    player.quirks = known != nullptr ? known->quirks : players::Quirks{players::kUnknown};
    Casting casting = castPlayer(player.desktopEntry, player.name);
    if (casting.role == Role::None) continue;
    if ((player.quirks & players::kNeedsMedia) != 0 && !casting.byEntry && !hasMedia(player)) continue;
    Instance& instance = found.emplace_back(instanceOf(std::move(casting)));
    instance.process = player.callee.process;
    instance.owner = player.callee.name;
  }
}

/// The browser behind an instance, by its bus name; an empty one where the instance is none.
std::string_view browserOf(const Instance& instance) {
  const Program* const program = programByEntry(instance.entry);
  return program != nullptr && (program->quirks & players::kNeedsMedia) != 0 ? program->busName : "";
}

/// A browser and the extension that speaks for it are one player: the browser speaks for itself where it can.
void dropExtensions(std::vector<Instance>& found) {
  const auto isExtension = [](const Instance& instance) {
    const Player* const player = playerOf(instance);
    return player != nullptr && (player->quirks & players::kSpeaksForBrowser) != 0;
  };
  std::set<std::string_view> speaking;
  for (const Instance& instance : found) {
    if (!isExtension(instance)) speaking.insert(browserOf(instance));
  }
  std::erase_if(found, [&](const Instance& instance) {
    return isExtension(instance) && speaking.contains(browserOf(instance));
  });
}

/// Makes sure that every program is there that has windows on the bus.
void addConnections(std::vector<Instance>& found) {
  for (const Connection& connection : connections()) {
    const pid_t process = connection.callee.process;
    auto instance = std::ranges::find_if(
        found, [&](const Instance& each) { return process != 0 && each.process == process; });
    if (instance == found.end()) {
      Window window;
      window.applicationID = connection.program->entry;
      Casting casting = castWindow(window);
      if (casting.role == Role::None) continue;
      if (casting.ground == Ground::DesktopEntry) casting.ground = Ground::BusWindows;
      instance = found.insert(found.end(), instanceOf(std::move(casting)));
      instance->process = process;
    }
    instance->connection = connection.callee.name;
  }
}

/// Whether the window is named after what the player plays.
bool isNamedAfter(const Window& window, const Instance& instance) {
  Player* const player = playerOf(instance);
  try {
    const std::string playing = player != nullptr ? stateOf(*player).title : std::string();
    return !playing.empty() && window.title.find(playing) != std::string::npos;
  } catch (const tarnscript::Refusal&) {
    return false;
  }
}

/// Whom a window belongs to although no process says so, by their desktop entry: a player that speaks on the
/// bus through the proxy of its sandbox, or a program whose windows do not tell their process. Of several the
/// one that the title speaks of, else one that has no window yet.
Instance* ownerByEntry(std::vector<Instance>& found, const Window& window, const Casting& casting) {
  const auto fits = [&](const Instance& instance) {
    if (instance.entry.empty() || instance.entry != casting.entry || anyBelongsTo(instance)) return false;
    return !instance.owner.empty() || !instance.connection.empty() ||
           (instance.process == 0 && window.process == 0);
  };
  std::vector<Instance*> owners;
  for (Instance& instance : found) {
    if (fits(instance)) owners.push_back(&instance);
  }
  if (owners.size() < 2) return owners.empty() ? nullptr : owners.front();
  const auto looked = windows::look(std::span(&window.id, 1));
  const Window& now = looked.empty() ? window : looked.front();
  return *std::ranges::max_element(owners, {}, [&](const Instance* owner) {
    return std::pair(isNamedAfter(now, *owner), owner->windows.empty());
  });
}

/// Makes sure that every program with a window in a role is there.
void addPrograms(std::vector<Instance>& found) {
  for (const Window& window : sWindows) {
    if (std::ranges::any_of(found, [&](const Instance& instance) { return belongsTo(window, instance); })) {
      continue;
    }
    Casting casting = castWindow(window);
    Instance* owner = ownerByEntry(found, window, casting);
    if (owner == nullptr && casting.role == Role::None) continue;
    if (owner == nullptr) owner = &found.emplace_back(instanceOf(std::move(casting)));
    if (window.process != 0) {
      owner->process = window.process;
    } else {
      owner->windows.push_back(window.id);
    }
  }
}

/// What tells a program apart whose process nobody knows.
std::uint32_t numberWithoutProcess(const Instance& instance) {
  if (!instance.windows.empty()) return static_cast<std::uint32_t>(instance.windows.front().number);
  return static_cast<std::uint32_t>(std::hash<std::string>()(instance.owner + instance.connection));
}

void addWindows(std::vector<Instance>& found) {
  for (Instance& instance : found) {
    for (const Window& window : sWindows) {
      if (belongsTo(window, instance) && !showsOtherDocument(window, instance)) {
        instance.windows.push_back(window.id);
      }
    }
    instance.serialNumber.low = static_cast<std::uint32_t>(instance.process);
    instance.serialNumber.high =
        instance.process != 0 ? system::startTime(instance.process) : numberWithoutProcess(instance);
  }
}

bool sameList(const std::vector<Instance>& a, const std::vector<Instance>& b) {
  return std::is_permutation(a.begin(), a.end(), b.begin(), b.end(),
                             [](const Instance& x, const Instance& y) {
                               return x.role == y.role && x.serialNumber == y.serialNumber &&
                                      x.owner == y.owner && x.connection == y.connection;
                             });
}

/// Looks once a turn, as nothing tells, whether windows of a suite have another document in them. True when
/// one has.
bool readChangingClasses() {
  if (sClassesRead == base::turn()) return false;
  sClassesRead = base::turn();
  bool changed = false;
  for (Window& window : sWindows) {
    if (!isOfSuite(window.className)) continue;
    const auto looked = windows::look(std::span(&window.id, 1));
    if (looked.empty() || looked.front().className == window.className) continue;
    window.className = looked.front().className;
    changed = true;
  }
  return changed;
}

bool plays(const Instance& instance) {
  Player* const player = playerOf(instance);
  if (player == nullptr) return false;
  try {
    const bool now = statusOf(*player) == players::PlaybackStatus::Playing;
    // One that announces nothing is only seen to play where somebody looks.
    if (now && player->lastPlayed == 0) player->lastPlayed = players::nextUse();
    return now;
  } catch (const tarnscript::Refusal&) {
    return false;
  }
}

std::uint64_t lastUse(const Instance& instance) {
  const Player* const player = playerOf(instance);
  return std::max(instance.lastSpokenTo, player != nullptr ? player->lastPlayed : 0);
}

/// Who this turn has found to be first; null where it has found none that is still there.
const Instance* firstOfThisTurn(Role role) {
  if (sFirstFoundIn != base::turn()) sFirst.clear();
  sFirstFoundIn = base::turn();
  const auto found = sFirst.find(role);
  const Instance* const first = found != sFirst.end() ? findInstance(found->second) : nullptr;
  return first != nullptr && first->role == role ? first : nullptr;
}

}  // namespace

void takeInDesktop() {
  const bool playersChanged = players::takeInPlayers();
  const bool connectionsChanged = takeInConnections();
  const bool windowsChanged = windows::takeIn();
  if (windowsChanged) {
    sWindows = windows::list();
    sClassesRead = base::turn();
  }
  const bool classesChanged = readChangingClasses();
  if (!playersChanged && !connectionsChanged && !windowsChanged && !classesChanged) return;
  std::vector<Instance> found;
  addPlayers(found);
  dropExtensions(found);
  addConnections(found);
  addPrograms(found);
  addWindows(found);
  for (Instance& instance : found) {
    const Instance* const before = findInstance(instance.serialNumber);
    if (before != nullptr) instance.lastSpokenTo = before->lastSpokenTo;
  }
  if (!sameList(found, sInstances)) ++sSeed;
  sInstances = std::move(found);
}

std::uint32_t applicationListSeed() { return sSeed; }

const std::vector<Instance>& instances() { return sInstances; }

bool isPlayed(Role role) { return std::ranges::find(sInstances, role, &Instance::role) != sInstances.end(); }

std::vector<const Instance*> rankedInstances(Role role) {
  struct Rank {
    bool inFront;
    bool plays;
    std::uint64_t lastUse;
    std::uint32_t started;
    const Instance* instance;

    auto key() const { return std::tuple(inFront, plays, lastUse, started); }
  };
  std::vector<Rank> ranks;
  for (const Instance& instance : sInstances) {
    if (instance.role == role)
      ranks.push_back({false, false, lastUse(instance), instance.serialNumber.high, &instance});
  }
  // Who plays may have to be asked for: only where there is something to choose.
  if (ranks.size() > 1) {
    const Instance* const front = frontInstance();
    for (Rank& rank : ranks) {
      rank.plays = plays(*rank.instance);
      rank.inFront = rank.instance == front;
    }
    std::ranges::stable_sort(ranks, std::greater(), &Rank::key);
  }
  std::vector<const Instance*> ordered(ranks.size());
  std::ranges::transform(ranks, ordered.begin(), &Rank::instance);
  return ordered;
}

const Instance* firstInstance(Role role) {
  if (const Instance* const first = firstOfThisTurn(role)) return first;
  const auto ordered = rankedInstances(role);
  if (ordered.empty()) return nullptr;
  sFirst.insert_or_assign(role, ordered.front()->serialNumber);
  return ordered.front();
}

void noteSpokenTo(const Instance& instance) {
  const auto found = std::ranges::find(sInstances, instance.serialNumber, &Instance::serialNumber);
  if (found != sInstances.end()) found->lastSpokenTo = players::nextUse();
}

const Instance* findInstance(const HostProcessSerialNumber& serialNumber) {
  const auto found = std::ranges::find(sInstances, serialNumber, &Instance::serialNumber);
  return found != sInstances.end() ? &*found : nullptr;
}

const Instance* frontInstance() {
  const Window* const front = windows::front();
  if (front == nullptr) return nullptr;
  const auto found = std::ranges::find_if(sInstances, [&](const Instance& instance) {
    return std::ranges::find(instance.windows, front->id) != instance.windows.end();
  });
  return found != sInstances.end() ? &*found : nullptr;
}

Player* playerOf(const Instance& instance) {
  return instance.owner.empty() ? nullptr : players::findPlayer(instance.owner);
}

void bringToFront(const Instance& instance) {
  if (!instance.windows.empty()) return windows::activate(instance.windows.front());
  Player* const player = playerOf(instance);
  if (player == nullptr) return;
  try {
    raise(*player);
  } catch (const tarnscript::Refusal&) {
    // A player that cannot be raised stays where it is.
  }
}

}  // namespace linux::programs
