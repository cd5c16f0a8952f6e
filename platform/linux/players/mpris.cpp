#include "platform/linux/players/mpris.h"

#include <algorithm>
#include <charconv>

#include "platform/linux/players/mpris_names.h"
#include "platform/linux/system/bus_values.h"
#include "platform/tarnscript/tarnscript.h"
#include "platform/text/utf8.h"

namespace linux::players {

namespace {

using system::kCommandLimit;
using system::kQueryLimit;
using system::Message;
using system::Method;
using system::readBoolean;
using system::readDictionary;
using system::readNumber;
using system::readText;

/// Longer than anything that is played, in microseconds: times beyond it are garbage.
constexpr double kLongestTime = 1e6 * 3600 * 1000;

/// No film is so short, in microseconds: its player counts milliseconds.
constexpr std::int64_t kShortestFilm = 30'000'000;

constexpr double kFastestRate = 100;
/// Players that can amplify go a little above 1.
constexpr double kLoudest = 10;

/// What the interface has for "no track"; it may not be sent back.
constexpr std::string_view kNoTrack = "/org/mpris/MediaPlayer2/TrackList/NoTrack";

[[noreturn]] void refuse(const char* reason) { throw tarnscript::Refusal{reason}; }

/// What a player refuses, it also answers late or not at all; which of them it was makes no difference here.
Message ask(const Player& player, const char* member, const char* interface, const char* property = nullptr) {
  const Method method{mpris::kPath, mpris::kPropertiesInterface, member};
  return property == nullptr ? system::call(player.callee, method, kQueryLimit, "s", interface)
                             : system::call(player.callee, method, kQueryLimit, "ss", interface, property);
}

/// All properties at once. Asking for a single optional one ends some players.
Message askForAll(const Player& player, const char* interface) { return ask(player, "GetAll", interface); }

std::optional<std::int64_t> timeFrom(std::optional<double> number) {
  if (!number || *number < 0 || *number > kLongestTime) return std::nullopt;
  return static_cast<std::int64_t>(*number);
}

double held(std::optional<double> number, double least, double most, double otherwise) {
  return number && *number >= least && *number <= most ? *number : otherwise;
}

/// Some players have an empty track id, or a text instead of a path. Whoever sends such a thing on is thrown
/// off the bus.
std::string usableTrackID(const std::string& text) {
  if (text == kNoTrack || sd_bus_object_path_is_valid(text.c_str()) <= 0) return {};
  return text;
}

/// The last part of an address as people read it: "film%201.mkv" is "film 1.mkv".
std::string fileName(std::string_view url) {
  const std::string_view part = url.substr(url.rfind('/') + 1);
  std::string name;
  for (std::size_t i = 0; i < part.size(); ++i) {
    unsigned char byte = 0;
    const char* const digits = part.data() + i + 1;
    if (part[i] == '%' && i + 2 < part.size() &&
        std::from_chars(digits, digits + 2, byte, 16).ptr == digits + 2 && byte != 0) {
      name.push_back(static_cast<char>(byte));
      i += 2;
    } else {
      name.push_back(part[i]);
    }
  }
  return text::isUTF8(name) ? name : std::string(part);
}

void readMetadata(sd_bus_message* message, PlayerState& state) {
  readDictionary(message, [&](std::string_view key, std::string_view type) {
    if (key == "mpris:trackid") state.trackID = usableTrackID(readText(message, type).value_or(""));
    if (key == "mpris:length") state.length = timeFrom(readNumber(message, type));
    if (key == "xesam:title") state.title = readText(message, type).value_or("");
    if (key == "xesam:url") state.url = readText(message, type).value_or("");
  });
  if (state.length == 0) state.length.reset();
  if (state.title.empty()) state.title = fileName(state.url);
}

void readProperty(sd_bus_message* message, std::string_view key, std::string_view type, PlayerState& state) {
  if (key == mpris::kPlaybackStatus) {
    state.told = mpris::statusNamed(readText(message, type).value_or("")).value_or(PlaybackStatus::Stopped);
  } else if (key == "Rate") {
    // Nothing plays at rate 0, though some say so.
    const double rate = held(readNumber(message, type), -kFastestRate, kFastestRate, 1);
    state.rate = rate != 0 ? rate : 1;
  } else if (key == "MinimumRate") {
    state.minimumRate = held(readNumber(message, type), -kFastestRate, kFastestRate, 1);
  } else if (key == "MaximumRate") {
    state.maximumRate = held(readNumber(message, type), -kFastestRate, kFastestRate, 1);
  } else if (key == "Volume") {
    state.volume = held(readNumber(message, type), 0, kLoudest, 1);
  } else if (key == "Position") {
    state.position = timeFrom(readNumber(message, type)).value_or(0);
  } else if (key == "CanSeek") {
    state.canSeek = readBoolean(message, type).value_or(false);
  } else if (key == "CanGoNext") {
    state.canGoNext = readBoolean(message, type).value_or(false);
  } else if (key == "CanGoPrevious") {
    state.canGoPrevious = readBoolean(message, type).value_or(false);
  } else if (key == "Metadata" && type == "a{sv}") {
    readMetadata(message, state);
  }
}

/// What is not answered in time is on its way all the same: a busy player comes to it.
template <typename... Arguments>
void command(Player& player, const Method& method, const char* types, Arguments... arguments) {
  if (system::timedOutThisTurn(player.callee.process)) {
    if (!system::send(player.callee, method, types, arguments...)) refuse("the player cannot be reached");
    return;
  }
  const Message answer = system::call(player.callee, method, kCommandLimit, types, arguments...);
  if (answer == nullptr && !system::timedOutThisTurn(player.callee.process)) {
    refuse("the player cannot or will not");
  }
  if (answer != nullptr) settle(player);
}

template <typename Argument>
void setProperty(Player& player, const char* interface, const char* property, const char* type,
                 Argument value) {
  command(player, {mpris::kPath, mpris::kPropertiesInterface, "Set"}, "ssv", interface, property, type,
          value);
}

/// Play and Pause toggle in some players, and Play starts the track over in others: only a player whose
/// status differs is told.
void bringTo(Player& player, PlaybackStatus wanted, const char* member) {
  believe(player, wanted);
  try {
    command(player, {mpris::kPath, mpris::kPlayerInterface, member}, "");
  } catch (const tarnscript::Refusal&) {
    player.wish.reset();
    throw;
  }
}

/// Of a command that was not waited for.
int takeAnswer(sd_bus_message* answer, void* context, sd_bus_error*) {
  Player& player = *static_cast<Player*>(context);
  if (sd_bus_message_is_method_error(answer, nullptr) != 0) {
    player.wish.reset();
  } else {
    settle(player);
  }
  return 0;
}

}  // namespace

PlayerState stateOf(Player& player) {
  const Message answer = askForAll(player, mpris::kPlayerInterface);
  if (answer == nullptr) refuse("the player does not answer");
  PlayerState state;
  readDictionary(answer.get(), [&](std::string_view key, std::string_view type) {
    readProperty(answer.get(), key, type, state);
  });
  if ((player.quirks & kCountsMilliseconds) != 0 && state.length && *state.length < kShortestFilm) {
    state.tick = 1000;
    state.position *= state.tick;
    *state.length *= state.tick;
  }
  state.status = believedCommand(player).value_or(state.told);
  return state;
}

PlaybackStatus statusOf(Player& player) {
  const auto status = believedStatus(player);
  return status ? *status : statusToldBy(player);
}

PlaybackStatus statusToldBy(Player& player) {
  // Every player has this property.
  const Message answer = ask(player, "Get", mpris::kPlayerInterface, mpris::kPlaybackStatus);
  const char* text = nullptr;
  if (answer != nullptr && sd_bus_message_read(answer.get(), "v", "s", &text) > 0) {
    player.lastKnown = mpris::statusNamed(text).value_or(PlaybackStatus::Stopped);
  } else if (!player.lastKnown) {
    refuse("the player does not answer");
  }
  return *player.lastKnown;
}

bool hasMedia(Player& player) {
  try {
    const PlayerState state = stateOf(player);
    return state.told != PlaybackStatus::Stopped &&
           (!state.title.empty() || !state.url.empty() || state.length.has_value());
  } catch (const tarnscript::Refusal&) {
    return player.lastKnown != PlaybackStatus::Stopped;
  }
}

std::optional<bool> fullscreenOf(Player& player) {
  const Message answer = askForAll(player, mpris::kRootInterface);
  std::optional<bool> fullscreen;
  if (answer == nullptr) return fullscreen;
  readDictionary(answer.get(), [&](std::string_view key, std::string_view type) {
    if (key == "Fullscreen") fullscreen = readBoolean(answer.get(), type);
  });
  return fullscreen;
}

std::vector<std::string> trackListOf(Player& player) {
  const Message answer = askForAll(player, mpris::kTrackListInterface);
  std::vector<std::string> tracks;
  if (answer == nullptr) return tracks;
  readDictionary(answer.get(), [&](std::string_view key, std::string_view type) {
    if (key != "Tracks" || type != "ao") return;
    if (sd_bus_message_enter_container(answer.get(), SD_BUS_TYPE_ARRAY, "o") <= 0) return;
    while (const auto track = readText(answer.get(), "o")) tracks.push_back(*track);
    sd_bus_message_exit_container(answer.get());
  });
  return tracks;
}

void play(Player& player) {
  if ((player.quirks & kIgnoresPlay) != 0) return toggleToPlay(player);
  if (statusOf(player) != PlaybackStatus::Playing) bringTo(player, PlaybackStatus::Playing, "Play");
}

void toggleToPlay(Player& player) {
  const auto wished = believedCommand(player);
  if ((wished ? *wished : statusToldBy(player)) == PlaybackStatus::Playing) return;
  bringTo(player, PlaybackStatus::Playing, "PlayPause");
}

void pause(Player& player) {
  if (statusOf(player) != PlaybackStatus::Playing) return;
  believe(player, PlaybackStatus::Paused);
  // Not waited for: the player that is about to start shall not be held up by those that make room for it.
  player.commanding = system::callLater(
      system::makeCall(player.callee, {mpris::kPath, mpris::kPlayerInterface, "Pause"}), takeAnswer, &player);
  if (player.commanding == nullptr) {
    player.wish.reset();
    refuse("the player cannot be reached");
  }
}

void stop(Player& player) {
  if (statusOf(player) != PlaybackStatus::Stopped) bringTo(player, PlaybackStatus::Stopped, "Stop");
}

void goToTrack(Player& player, const std::string& trackID) {
  believe(player, PlaybackStatus::Playing);
  command(player, {mpris::kPath, mpris::kTrackListInterface, "GoTo"}, "o", trackID.c_str());
}

void invoke(Player& player, const char* member) {
  player.status.reset();
  player.wish.reset();
  command(player, {mpris::kPath, mpris::kPlayerInterface, member}, "");
}

void seekBy(Player& player, std::int64_t offset) {
  const PlayerState state = stateOf(player);
  seekTo(player, state, state.position + offset);
}

void seekTo(Player& player, std::int64_t position) { seekTo(player, stateOf(player), position); }

void seekTo(Player& player, const PlayerState& state, std::int64_t position) {
  position = std::max<std::int64_t>(position, 0);
  believe(player, state.status);
  if (state.trackID.empty()) {
    command(player, {mpris::kPath, mpris::kPlayerInterface, "Seek"}, "x",
            (position - state.position) / state.tick);
  } else {
    command(player, {mpris::kPath, mpris::kPlayerInterface, "SetPosition"}, "ox", state.trackID.c_str(),
            position / state.tick);
  }
}

bool takesRate(const Player& player, const PlayerState& state, double rate) {
  return (player.quirks & kIgnoresRate) == 0 && rate >= state.minimumRate && rate <= state.maximumRate;
}

void setRate(Player& player, double rate) { setProperty(player, mpris::kPlayerInterface, "Rate", "d", rate); }

void setVolume(Player& player, double volume) {
  setProperty(player, mpris::kPlayerInterface, "Volume", "d", volume);
}

void setFullscreen(Player& player, bool fullscreen) {
  setProperty(player, mpris::kRootInterface, "Fullscreen", "b", fullscreen ? 1 : 0);
}

void raise(Player& player) {
  if ((player.quirks & kIgnoresRaise) != 0) refuse("the player takes a Raise and stays where it is");
  command(player, {mpris::kPath, mpris::kRootInterface, "Raise"}, "");
}

}  // namespace linux::players
