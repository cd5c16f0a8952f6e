#include "platform/linux/players/players.h"

#include <algorithm>
#include <map>
#include <utility>

#include "platform/linux/players/mpris_names.h"
#include "platform/linux/system/bus_values.h"
#include "platform/linux/system/names.h"

namespace linux::players {

namespace {

using system::bus;
using system::kQueryLimit;
using system::Message;
using system::readDictionary;
using system::readText;

/// How long a player may take to answer a command, and then to do what it has been told. Until then the
/// answer to a question may be older than the command.
constexpr std::chrono::milliseconds kAnswering{1500};
constexpr std::chrono::milliseconds kSettling{500};

/// A player for other players; its status is that of somebody who is on the list already.
constexpr std::string_view kProxy = "playerctld";

std::list<Player> sPlayers;
/// The owner of each name that players have on the bus, without the prefix. A player may have several.
std::map<std::string, std::string> sOwners;
bool sChanged = false;
std::uint64_t sPlaybackChanges = 0;
/// The connection that all this is known from, and whether it has told of all players that were there first.
unsigned sGeneration = 0;
bool sFirstAreKnown = false;

/// The identifier of a desktop entry, as a player tells it; never a path.
std::string entryFrom(std::string text) {
  constexpr std::string_view kSuffix = ".desktop";
  if (text.ends_with(kSuffix)) text.resize(text.size() - kSuffix.size());
  return text.find('/') == std::string::npos ? text : std::string();
}

int takeIntroduction(sd_bus_message* answer, void* context, sd_bus_error*) {
  Player& player = *static_cast<Player*>(context);
  if (sd_bus_message_is_method_error(answer, nullptr) != 0) {
    player.introduction = Introduction::Refused;
    return 0;
  }
  player.introduction = Introduction::Complete;
  readDictionary(answer, [&](std::string_view key, std::string_view type) {
    if (key == "DesktopEntry") player.desktopEntry = entryFrom(readText(answer, type).value_or(""));
  });
  sChanged = true;
  return 0;
}

/// Asks who it is, for as long as the player is there: one that is stopped answers when it is continued.
void introduce(Player& player) {
  Message request = system::makeCall(player.callee, {mpris::kPath, mpris::kPropertiesInterface, "GetAll"});
  if (request == nullptr || sd_bus_message_append(request.get(), "s", mpris::kRootInterface) < 0) return;
  player.introducing = system::callLater(std::move(request), takeIntroduction, &player);
  if (player.introducing != nullptr) player.introduction = Introduction::Awaited;
}

void arrive(const std::string& name, const std::string& owner) {
  sOwners[name] = owner;
  if (findPlayer(owner) != nullptr) return;
  Player& player = sPlayers.emplace_back();
  player.name = name;
  player.callee = {owner, 0};
  sChanged = true;
  system::processOf(owner);
  introduce(player);
}

void leave(const std::string& name) {
  const auto left = sOwners.find(name);
  if (left == sOwners.end()) return;
  const std::string owner = std::move(left->second);
  sOwners.erase(left);
  const auto other =
      std::find_if(sOwners.begin(), sOwners.end(), [&](const auto& entry) { return entry.second == owner; });
  sChanged = true;
  if (other == sOwners.end()) {
    std::erase_if(sPlayers, [&](const Player& player) { return player.callee.name == owner; });
  } else if (Player* const player = findPlayer(owner)) {
    player->name = other->first;
  }
}

bool isPlayer(std::string_view name) {
  return name.starts_with(mpris::kPrefix) && name.substr(mpris::kPrefix.size()) != kProxy;
}

void takeOwnerChange(const std::string& name, const std::string& before, const std::string& after) {
  const std::string player = name.substr(mpris::kPrefix.size());
  if (!before.empty()) leave(player);
  if (!after.empty()) arrive(player, after);
}

constexpr system::NameFollower kFollower{isPlayer, takeOwnerChange};

/// A status that comes while another one is wished for is from before the command.
void takeStatus(Player& player, PlaybackStatus status) {
  if (player.wish && player.wish->status != status && !player.wish->until.hasPassed()) return;
  if (player.status != status && player.lastKnown != status) ++sPlaybackChanges;
  if (status == PlaybackStatus::Playing && player.status != status) player.lastPlayed = nextUse();
  player.status = player.lastKnown = status;
  player.wish.reset();
}

int takePropertyChange(sd_bus_message* signal, void*, sd_bus_error*) {
  const char* const sender = sd_bus_message_get_sender(signal);
  Player* const player = sender != nullptr ? findPlayer(sender) : nullptr;
  const char* interface = nullptr;
  if (player == nullptr || sd_bus_message_read(signal, "s", &interface) <= 0) return 0;
  // It may have got something to play, or have nothing any more.
  if ((player->quirks & kNeedsMedia) != 0) sChanged = true;
  readDictionary(signal, [&](std::string_view key, std::string_view type) {
    if (key != mpris::kPlaybackStatus) return;
    if (const auto status = mpris::statusNamed(readText(signal, type).value_or(""))) {
      takeStatus(*player, *status);
    }
  });
  if (sd_bus_message_enter_container(signal, SD_BUS_TYPE_ARRAY, "s") <= 0) return 0;
  while (const auto invalidated = readText(signal, "s")) {
    if (*invalidated == mpris::kPlaybackStatus) player->status.reset();
  }
  return 0;
}

void beginAnew() {
  sChanged = sChanged || !sPlayers.empty();
  sPlayers.clear();
  sOwners.clear();
  sGeneration = system::busGeneration();
  sFirstAreKnown = false;
  if (bus() == nullptr) return;
  const std::string changes = std::string("type='signal',path='") + mpris::kPath + "',interface='" +
                              mpris::kPropertiesInterface + "',member='PropertiesChanged',arg0='" +
                              mpris::kPlayerInterface + "'";
  sd_bus_add_match_async(bus(), nullptr, changes.c_str(), takePropertyChange, nullptr, nullptr);
  system::followNames(kFollower);
}

/// False while the bus has not answered.
bool learnProcess(Player& player) {
  const auto process = system::processOf(player.callee.name);
  if (process && *process != player.callee.process) {
    player.callee.process = *process;
    sChanged = true;
  }
  return player.processIsKnown = player.processIsKnown || process.has_value();
}

bool anyAwaited() {
  return std::any_of(sPlayers.begin(), sPlayers.end(), [](Player& player) {
    return !learnProcess(player) || player.introduction == Introduction::Awaited;
  });
}

/// Waits for newcomers to introduce themselves; one that does not is a late one from then on.
void awaitIntroductions() {
  for (Player& player : sPlayers) {
    if (player.introduction == Introduction::Refused) introduce(player);
  }
  const system::Limit limit = system::patience(kQueryLimit);
  const base::Deadline deadline(limit);
  while (anyAwaited()) {
    system::takeInBus();
    if (!anyAwaited()) return;
    if (!system::waitForBus(deadline)) break;
  }
  if (!anyAwaited()) return;
  system::noteWaitInVain(limit);
  for (Player& player : sPlayers) {
    player.processIsKnown = true;
    if (player.introduction != Introduction::Awaited) continue;
    player.introduction = Introduction::Late;
    system::noteTimeout(player.callee.process);
  }
}

}  // namespace

bool takeInPlayers() {
  if (bus() == nullptr || sGeneration != system::busGeneration()) beginAnew();
  if (!sFirstAreKnown) sFirstAreKnown = system::tellNames(kFollower);
  system::takeInBus();
  awaitIntroductions();
  return std::exchange(sChanged, false);
}

std::uint64_t nextUse() {
  static std::uint64_t last = 0;
  return ++last;
}

std::uint64_t playbackChanges() { return sPlaybackChanges; }

std::list<Player>& list() { return sPlayers; }

Player* findPlayer(std::string_view owner) {
  const auto found = std::find_if(sPlayers.begin(), sPlayers.end(),
                                  [&](const Player& player) { return player.callee.name == owner; });
  return found != sPlayers.end() ? &*found : nullptr;
}

std::optional<PlaybackStatus> believedCommand(const Player& player) {
  if (!player.wish || player.wish->until.hasPassed()) return std::nullopt;
  return player.wish->status;
}

std::optional<PlaybackStatus> believedStatus(const Player& player) {
  return player.status ? player.status : believedCommand(player);
}

void believe(Player& player, PlaybackStatus status) {
  ++sPlaybackChanges;
  player.status.reset();
  player.lastKnown = status;
  player.wish = Wish{status, base::Deadline(kAnswering)};
}

void settle(Player& player) {
  if (player.wish) player.wish->until = base::Deadline(kSettling);
}

}  // namespace linux::players
