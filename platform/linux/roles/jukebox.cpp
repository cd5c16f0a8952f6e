#include "platform/linux/roles/jukebox.h"

#include <algorithm>
#include <cmath>

#include "platform/linux/players/playback.h"
#include "platform/linux/players/scan.h"
#include "platform/linux/roles/playing.h"
#include "platform/linux/roles/role_application.h"
#include "platform/scripting/lyrabox_dictionary.h"

namespace linux::roles {

namespace {

namespace words = scripting::lyrabox;
using players::PlaybackStatus;
using players::PlayerState;
using tarnscript::Constant;
using tarnscript::ObjectRef;
using tarnscript::Refusal;
using tarnscript::Value;

/// How fast a held scan button goes through a track.
constexpr double kScanRate = 8;
/// Back track restarts a track that has played for longer than this, in microseconds.
constexpr std::int64_t kWellUnderWay = 3'000'000;
/// The volume in the words of scripts.
constexpr double kFullVolume = 100;
/// Microseconds.
constexpr double kSecond = 1e6;
/// No position is that far from the beginning, in seconds.
constexpr double kLongest = 1e9;

/// The one track that a player tells of.
constexpr std::uint64_t kCurrent = 1;

class Jukebox final : public RoleApplication {
 public:
  Jukebox() : RoleApplication(programs::Role::Jukebox) {}

  const tarnscript::Dictionary& dictionary() const override { return words::dictionary(); }

 protected:
  Value getBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property) override;
  void setBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property,
             const Value& value) override;
  std::vector<ObjectRef> elementsBy(const Performer& performer, const ObjectRef& object,
                                    tarnscript::Code cls) override;
  Value performBy(const Performer& performer, const tarnscript::Event& event) override;
};

words::Code playerState(players::Player& player) {
  if (const auto rate = players::scanRate(player)) {
    return *rate > 0 ? words::kFastForwarding : words::kRewinding;
  }
  switch (players::statusOf(player)) {
    case PlaybackStatus::Playing:
      return words::kPlaying;
    case PlaybackStatus::Paused:
      return words::kPaused;
    case PlaybackStatus::Stopped:
      break;
  }
  return words::kStopped;
}

Value getOfTrack(players::Player& player, tarnscript::Code property) {
  const PlayerState state = players::stateOf(player);
  if (property == words::kName) return state.title;
  if (property == words::kDuration && state.length) return static_cast<double>(*state.length) / kSecond;
  throw Refusal{"the player does not tell that"};
}

Value Jukebox::getBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property) {
  players::Player& player = performer.player();
  if (object.cls == words::kTrack) return getOfTrack(player, property);
  switch (property) {
    case words::kPlayerState:
      return Constant{playerState(player)};
    case words::kPlayerPosition:
      return static_cast<double>(players::stateOf(player).position) / kSecond;
    case words::kSoundVolume:
      return static_cast<std::int64_t>(
          std::lround(std::min(players::stateOf(player).volume, 1.0) * kFullVolume));
    case words::kCurrentTrack:
      return ObjectRef{this, words::kTrack, kCurrent};
    default:
      return RoleApplication::getBy(performer, object, property);
  }
}

void Jukebox::setBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property,
                    const Value& value) {
  if (object.cls == words::kTrack) throw Refusal{"tracks cannot be changed"};
  if (property == words::kSoundVolume) {
    const double volume = tarnscript::toInt32(value) / kFullVolume;
    return players::setVolume(performer.player(), std::clamp(volume, 0.0, 1.0));
  }
  const auto* const seconds = std::get_if<double>(&value);
  if (property == words::kPlayerPosition && seconds != nullptr && std::abs(*seconds) < kLongest) {
    return players::seekTo(performer.player(), static_cast<std::int64_t>(*seconds * kSecond));
  }
  RoleApplication::setBy(performer, object, property, value);
}

std::vector<ObjectRef> Jukebox::elementsBy(const Performer& performer, const ObjectRef& object,
                                           tarnscript::Code cls) {
  if (object.cls != tarnscript::kApplicationClass || cls != words::kTrack) {
    return RoleApplication::elementsBy(performer, object, cls);
  }
  return {{this, words::kTrack, kCurrent}};
}

void goBack(players::Player& player) {
  const PlayerState state = players::stateOf(player);
  if (state.canSeek && state.position > kWellUnderWay) {
    players::seekTo(player, state, 0);
  } else {
    players::invoke(player, "Previous");
  }
}

Value Jukebox::performBy(const Performer& performer, const tarnscript::Event& event) {
  switch (event.command) {
    case words::kPlay:
      startPlaying(performer);
      break;
    case words::kPause:
    case words::kStop:
      endPlaying(performer);
      break;
    case words::kPlayPause:
      if (players::isPlaying(performer.player())) {
        endPlaying(performer);
      } else {
        startPlaying(performer);
      }
      break;
    case words::kResume:
      players::endFastPlaying(performer.player());
      break;
    case words::kFastForward:
      players::scan(performer.player(), kScanRate);
      break;
    case words::kRewind:
      players::scan(performer.player(), -kScanRate);
      break;
    case words::kBackTrack:
      players::endFastPlaying(performer.player());
      goBack(performer.player());
      break;
    case words::kNextTrack:
      players::endFastPlaying(performer.player());
      return RoleApplication::performBy(performer, event);
    default:
      return RoleApplication::performBy(performer, event);
  }
  return {};
}

}  // namespace

tarnscript::Application& jukebox() {
  static Jukebox application;
  return application;
}

}  // namespace linux::roles
