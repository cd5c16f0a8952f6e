#include "platform/linux/roles/movies.h"

#include <algorithm>
#include <cmath>

#include "platform/linux/players/playback.h"
#include "platform/linux/roles/playing.h"
#include "platform/linux/roles/remote_hud.h"
#include "platform/linux/roles/role_application.h"
#include "platform/scripting/movie_dictionaries.h"

namespace linux::roles {

namespace {

namespace words = scripting::movies;
using players::Player;
using tarnscript::ObjectRef;
using tarnscript::Refusal;
using tarnscript::Value;

/// A step of players that have none of their own, in microseconds.
constexpr std::int64_t kStep = 10'000'000;
/// Microseconds.
constexpr double kSecond = 1e6;
/// No position is that far from the beginning, in seconds.
constexpr double kLongest = 1e9;

class MoviePlayer final : public RoleApplication {
 public:
  /// The volume runs from 0 to `loudest`.
  MoviePlayer(programs::Role role, const tarnscript::Dictionary& dictionary, double loudest)
      : RoleApplication(role), dictionary_(dictionary), loudest_(loudest) {}

  const tarnscript::Dictionary& dictionary() const override { return dictionary_; }

 protected:
  Value getBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property) override;
  void setBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property,
             const Value& value) override;
  /// The film of the performer, where it has one.
  std::vector<ObjectRef> elementsBy(const Performer& performer, const ObjectRef& object,
                                    tarnscript::Code cls) override;
  Value performBy(const Performer& performer, const tarnscript::Event& event) override;

 private:
  void step(const Performer& performer, const tarnscript::Event& event, std::int64_t offset);

  const tarnscript::Dictionary& dictionary_;
  const double loudest_;
};

double numberIn(const Value& value) {
  const auto* const number = std::get_if<double>(&value);
  return number != nullptr ? *number : tarnscript::toInt32(value);
}

bool hasFilm(Player& player) {
  if (players::statusOf(player) != players::PlaybackStatus::Stopped) return true;
  const players::PlayerState state = players::stateOf(player);
  return !state.url.empty() || !state.title.empty();
}

/// A film is known by the process that shows it. Throws Refusal when that is no longer the performer.
Player& playerOfFilm(const Performer& performer, const ObjectRef& film) {
  if (film.cls != words::kDocument || film.id != performer.instance().serialNumber.low) {
    throw Refusal{"there is no such film"};
  }
  return performer.player();
}

std::vector<ObjectRef> MoviePlayer::elementsBy(const Performer& performer, const ObjectRef& object,
                                               tarnscript::Code cls) {
  if (object.cls != tarnscript::kApplicationClass || cls != words::kDocument) {
    return RoleApplication::elementsBy(performer, object, cls);
  }
  if (!hasFilm(performer.player())) return {};
  return {{this, words::kDocument, performer.instance().serialNumber.low}};
}

Value MoviePlayer::getBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property) {
  if (property == words::kViewerFullScreen) {
    if (const auto fullscreen = players::fullscreenOf(performer.player())) return *fullscreen;
    throw Refusal{"the player does not tell that"};
  }
  Player& player = playerOfFilm(performer, object);
  switch (property) {
    case words::kPlaying:
      return players::isPlaying(player);
    case words::kRate:
      return players::rateOf(player);
    case words::kName:
      return players::stateOf(player).title;
    case words::kVolume: {
      const double volume = std::min(players::stateOf(player).volume, 1.0) * loudest_;
      if (loudest_ == 1) return volume;
      return static_cast<std::int64_t>(std::lround(volume));
    }
    case words::kCurrentTime:
      return static_cast<double>(players::stateOf(player).position) / kSecond;
    case words::kDuration:
      if (const auto length = players::stateOf(player).length) return static_cast<double>(*length) / kSecond;
      break;
    default:
      break;
  }
  return RoleApplication::getBy(performer, object, property);
}

void MoviePlayer::setBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property,
                        const Value& value) {
  if (property == words::kViewerFullScreen) {
    return players::setFullscreen(performer.player(), tarnscript::toInt32(value) != 0);
  }
  Player& player = playerOfFilm(performer, object);
  const double number = numberIn(value);
  if (property == words::kRate) return playAtRate(performer, number);
  if (property == words::kVolume && !std::isnan(number)) {
    return players::setVolume(player, std::clamp(number / loudest_, 0.0, 1.0));
  }
  if (property == words::kCurrentTime && std::abs(number) < kLongest) {
    return players::seekTo(player, static_cast<std::int64_t>(number * kSecond));
  }
  RoleApplication::setBy(performer, object, property, value);
}

/// By the program's own step of one frame, which leaves the film standing; elsewhere by a stretch.
void MoviePlayer::step(const Performer& performer, const tarnscript::Event& event, std::int64_t offset) {
  players::endFastPlaying(performer.player());
  if (programs::hasOwnAction(performer.program(), event.command)) {
    RoleApplication::performBy(performer, event);
  } else {
    players::seekBy(performer.player(), offset);
  }
}

Value MoviePlayer::performBy(const Performer& performer, const tarnscript::Event& event) {
  const auto* const direct = event.direct ? std::get_if<ObjectRef>(&*event.direct) : nullptr;
  playerOfFilm(performer, direct != nullptr ? *direct : event.target);
  switch (event.command) {
    case words::kPlay:
      startPlaying(performer);
      break;
    case words::kPause:
    case words::kStop:
      endPlaying(performer);
      break;
    case words::kStepForward:
      step(performer, event, kStep);
      break;
    case words::kStepBackward:
      step(performer, event, -kStep);
      break;
    case words::kShowRemoteHUD:
      showRemoteHUD(performer);
      break;
    default:
      return RoleApplication::performBy(performer, event);
  }
  return {};
}

}  // namespace

tarnscript::Application& classicMovies() {
  static MoviePlayer application(programs::Role::ClassicMovies, words::classicDictionary(), 256);
  return application;
}

tarnscript::Application& modernMovies() {
  static MoviePlayer application(programs::Role::ModernMovies, words::modernDictionary(), 1);
  return application;
}

}  // namespace linux::roles
