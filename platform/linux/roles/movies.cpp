// The two movie players. They differ in their words and in the scale of their volume.

#include <algorithm>
#include <cmath>

#include "platform/linux/players/playback.h"
#include "platform/linux/roles/remote_hud.h"
#include "platform/linux/roles/role_application.h"
#include "platform/scripting/movie_dictionaries.h"

namespace desktop {

namespace {

namespace words = scripting::movies;
using tarnscript::ObjectRef;
using tarnscript::Refusal;
using tarnscript::Value;

/// A step of players that have none of their own, in microseconds.
constexpr std::int64_t kStep = 10'000'000;
constexpr double kSecond = 1e6;

class MoviePlayer final : public RoleApplication {
 public:
  /// The volume runs from 0 to `loudest`.
  MoviePlayer(Role role, const tarnscript::Dictionary& dictionary, double loudest)
      : RoleApplication(role), dictionary_(dictionary), loudest_(loudest) {}

  const tarnscript::Dictionary& dictionary() const override { return dictionary_; }
  Value get(const ObjectRef& object, tarnscript::Code property) override;
  void set(const ObjectRef& object, tarnscript::Code property, const Value& value) override;
  /// The film of the first instance, where it has one.
  std::vector<ObjectRef> elements(const ObjectRef& object, tarnscript::Code cls) override;
  Value perform(const tarnscript::Event& event) override;

 private:
  Player& playerOfFilm(const ObjectRef& film) const;
  void step(const tarnscript::Event& event, std::int64_t offset);

  const tarnscript::Dictionary& dictionary_;
  const double loudest_;
};

double numberIn(const Value& value) {
  const auto* const number = std::get_if<double>(&value);
  return number != nullptr ? *number : tarnscript::toInt32(value);
}

bool hasFilm(Player& player) {
  if (statusOf(player) != PlaybackStatus::Stopped) return true;
  const PlayerState state = stateOf(player);
  return !state.url.empty() || !state.title.empty();
}

/// A film is known by the process that shows it.
Player& MoviePlayer::playerOfFilm(const ObjectRef& film) const {
  const Instance& shown = instance();
  if (film.cls != words::kDocument || film.id != shown.serialNumber.low)
    throw Refusal{"there is no such film"};
  return requirePlayer(shown);
}

std::vector<ObjectRef> MoviePlayer::elements(const ObjectRef& object, tarnscript::Code cls) {
  if (object.cls != tarnscript::kApplicationClass || cls != words::kDocument) {
    return RoleApplication::elements(object, cls);
  }
  if (!hasFilm(player())) return {};
  return {{this, words::kDocument, instance().serialNumber.low}};
}

Value MoviePlayer::get(const ObjectRef& object, tarnscript::Code property) {
  if (property == words::kViewerFullScreen) {
    if (const auto fullscreen = fullscreenOf(player())) return *fullscreen;
    throw Refusal{"the player does not tell that"};
  }
  Player& player = playerOfFilm(object);
  switch (property) {
    case words::kPlaying:
      return isPlaying(player);
    case words::kRate:
      return rateOf(player);
    case words::kName:
      return stateOf(player).title;
    case words::kVolume: {
      const double volume = std::min(stateOf(player).volume, 1.0) * loudest_;
      if (loudest_ == 1) return volume;
      return static_cast<std::int64_t>(std::lround(volume));
    }
    case words::kCurrentTime:
      return static_cast<double>(stateOf(player).position) / kSecond;
    case words::kDuration:
      if (const auto length = stateOf(player).length) return static_cast<double>(*length) / kSecond;
      break;
    default:
      break;
  }
  return RoleApplication::get(object, property);
}

void MoviePlayer::set(const ObjectRef& object, tarnscript::Code property, const Value& value) {
  if (property == words::kViewerFullScreen) return setFullscreen(player(), tarnscript::toInt32(value) != 0);
  Player& player = playerOfFilm(object);
  const double number = numberIn(value);
  if (property == words::kRate) return playAtRate(instance(), number);
  if (property == words::kVolume && !std::isnan(number)) {
    return setVolume(player, std::clamp(number / loudest_, 0.0, 1.0));
  }
  if (property == words::kCurrentTime && std::abs(number) < 1e9) {
    return seekTo(player, static_cast<std::int64_t>(number * kSecond));
  }
  RoleApplication::set(object, property, value);
}

/// By mpv's own step of one frame, which leaves the film standing; elsewhere by a stretch.
void MoviePlayer::step(const tarnscript::Event& event, std::int64_t offset) {
  endFastPlaying(player());
  const Program* const program = instance().program;
  if (program != nullptr && std::string_view(program->entry) == "mpv") {
    RoleApplication::perform(event);
  } else {
    seekBy(player(), offset);
  }
}

Value MoviePlayer::perform(const tarnscript::Event& event) {
  const auto* const direct = event.direct ? std::get_if<ObjectRef>(&*event.direct) : nullptr;
  playerOfFilm(direct != nullptr ? *direct : event.target);
  switch (event.command) {
    case words::kPlay:
      startPlaying(instance());
      break;
    case words::kPause:
    case words::kStop:
      endPlaying(instance());
      break;
    case words::kStepForward:
      step(event, kStep);
      break;
    case words::kStepBackward:
      step(event, -kStep);
      break;
    case words::kShowRemoteHUD:
      showRemoteHUD(instance());
      break;
    default:
      return RoleApplication::perform(event);
  }
  return {};
}

}  // namespace

tarnscript::Application& classicMovies() {
  static MoviePlayer application(Role::ClassicMovies, words::classicDictionary(), 256);
  return application;
}

tarnscript::Application& modernMovies() {
  static MoviePlayer application(Role::ModernMovies, words::modernDictionary(), 1);
  return application;
}

}  // namespace desktop
