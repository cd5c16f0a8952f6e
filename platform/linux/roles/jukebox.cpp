// The jukebox: the words of a music player.

#include <algorithm>
#include <cmath>

#include "platform/linux/players/playback.h"
#include "platform/linux/roles/role_application.h"
#include "platform/linux/players/scan.h"
#include "platform/scripting/lyrabox_dictionary.h"

namespace desktop {

namespace {

namespace words = scripting::lyrabox;
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
constexpr double kSecond = 1e6;

/// The one track that a player tells of.
constexpr std::uint64_t kCurrent = 1;

class Jukebox final : public RoleApplication {
 public:
  Jukebox() : RoleApplication(Role::Jukebox) {}

  const tarnscript::Dictionary& dictionary() const override { return words::dictionary(); }
  Value get(const ObjectRef& object, tarnscript::Code property) override;
  void set(const ObjectRef& object, tarnscript::Code property, const Value& value) override;
  std::vector<ObjectRef> elements(const ObjectRef& object, tarnscript::Code cls) override;
  Value perform(const tarnscript::Event& event) override;

 private:
  Value getOfTrack(tarnscript::Code property) const;
  words::Code playerState() const;
  void backTrack() const;
};

words::Code Jukebox::playerState() const {
  if (const auto rate = scanRate(player())) return *rate > 0 ? words::kFastForwarding : words::kRewinding;
  switch (statusOf(player())) {
    case PlaybackStatus::Playing:
      return words::kPlaying;
    case PlaybackStatus::Paused:
      return words::kPaused;
    case PlaybackStatus::Stopped:
      break;
  }
  return words::kStopped;
}

Value Jukebox::getOfTrack(tarnscript::Code property) const {
  const PlayerState state = stateOf(player());
  if (property == words::kName) return state.title;
  if (property == words::kDuration && state.length) return static_cast<double>(*state.length) / kSecond;
  throw Refusal{"the player does not tell that"};
}

Value Jukebox::get(const ObjectRef& object, tarnscript::Code property) {
  if (object.cls == words::kTrack) return getOfTrack(property);
  switch (property) {
    case words::kPlayerState:
      return Constant{playerState()};
    case words::kPlayerPosition:
      return static_cast<double>(stateOf(player()).position) / kSecond;
    case words::kSoundVolume:
      return static_cast<std::int64_t>(std::lround(std::min(stateOf(player()).volume, 1.0) * kFullVolume));
    case words::kCurrentTrack:
      return ObjectRef{this, words::kTrack, kCurrent};
    default:
      return RoleApplication::get(object, property);
  }
}

void Jukebox::set(const ObjectRef& object, tarnscript::Code property, const Value& value) {
  if (object.cls == words::kTrack) throw Refusal{"tracks cannot be changed"};
  if (property == words::kSoundVolume) {
    return setVolume(player(), std::clamp(tarnscript::toInt32(value) / kFullVolume, 0.0, 1.0));
  }
  const auto* const seconds = std::get_if<double>(&value);
  if (property == words::kPlayerPosition && seconds != nullptr && std::abs(*seconds) < 1e9) {
    return seekTo(player(), static_cast<std::int64_t>(*seconds * kSecond));
  }
  RoleApplication::set(object, property, value);
}

std::vector<ObjectRef> Jukebox::elements(const ObjectRef& object, tarnscript::Code cls) {
  if (object.cls != tarnscript::kApplicationClass || cls != words::kTrack) {
    return RoleApplication::elements(object, cls);
  }
  return {{this, words::kTrack, kCurrent}};
}

void Jukebox::backTrack() const {
  const PlayerState state = stateOf(player());
  if (state.canSeek && state.position > kWellUnderWay) {
    seekTo(player(), state, 0);
  } else {
    invoke(player(), "Previous");
  }
}

Value Jukebox::perform(const tarnscript::Event& event) {
  switch (event.command) {
    case words::kPlay:
      startPlaying(instance());
      break;
    case words::kPause:
    case words::kStop:
      endPlaying(instance());
      break;
    case words::kPlayPause:
      if (isPlaying(player())) {
        endPlaying(instance());
      } else {
        startPlaying(instance());
      }
      break;
    case words::kResume:
      endFastPlaying(player());
      break;
    case words::kFastForward:
      scan(player(), kScanRate);
      break;
    case words::kRewind:
      scan(player(), -kScanRate);
      break;
    case words::kBackTrack:
      endFastPlaying(player());
      backTrack();
      break;
    case words::kNextTrack:
      endFastPlaying(player());
      return RoleApplication::perform(event);
    default:
      return RoleApplication::perform(event);
  }
  return {};
}

}  // namespace

tarnscript::Application& jukebox() {
  static Jukebox application;
  return application;
}

}  // namespace desktop
