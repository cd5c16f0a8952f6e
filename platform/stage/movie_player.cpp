#include "platform/stage/movie_player.h"

#include <algorithm>
#include <cmath>
#include <utility>

#include "platform/scripting/movie_dictionaries.h"
#include "platform/stage/quantities.h"

namespace stage {

namespace {

namespace words = scripting::movies;
using tarnscript::ObjectRef;
using tarnscript::Value;

constexpr Nanoseconds kFrame = kSecond / 25;

double numberOf(const Value& value) {
  if (const auto* real = std::get_if<double>(&value)) return *real;
  return tarnscript::toInt32(value);
}

}  // namespace

MoviePlayer::MoviePlayer(const scripting::Identity& identity, std::string bundleVersion,
                         const tarnscript::Dictionary& words, double loudest)
    : Application(identity, std::move(bundleVersion)), words_(words), loudest_(loudest) {}

void MoviePlayer::started() {
  movies_ = {{1, "Dune Walk", 600 * kSecond, loudest_ / 2, {}},
             {2, "Tide Tables", 95 * kSecond, loudest_ / 2, {}}};
}

void MoviePlayer::ended() { movies_.clear(); }

std::optional<Nanoseconds> MoviePlayer::nextChange() const {
  std::optional<Nanoseconds> next;
  for (const Movie& movie : movies_) next = earlier(next, movie.playhead.arrival(movie.length));
  return next;
}

void MoviePlayer::advance() {
  for (Movie& movie : movies_) {
    const auto end = movie.playhead.arrival(movie.length);
    if (end && *end <= now()) setRate(movie, 0, *end);
  }
}

std::string MoviePlayer::describe(const Movie& movie) {
  const double rate = movie.playhead.rate();
  const std::string title = '"' + movie.title + '"';
  if (rate == 0) return "stands in " + title + " at " + positionText(movie.playhead.position());
  return "plays " + title + (rate == 1 ? "" : " at rate " + numberText(rate));
}

std::string MoviePlayer::describe() const {
  return movies_.empty() ? "nothing open" : describe(movies_.front());
}

std::string MoviePlayer::details() const {
  if (movies_.empty()) return {};
  const Movie& front = movies_.front();
  return positionText(front.playhead.position()) + "/" + positionText(front.length) + ", volume " +
         numberText(front.volume);
}

MoviePlayer::Movie& MoviePlayer::movieOf(const ObjectRef& object) {
  const auto found =
      std::find_if(movies_.begin(), movies_.end(), [&](const Movie& movie) { return movie.id == object.id; });
  if (object.application != this || object.cls != words::kDocument || found == movies_.end()) {
    throw tarnscript::Refusal{"there is no such movie"};
  }
  return *found;
}

void MoviePlayer::setRate(Movie& movie, double rate, Nanoseconds when) {
  if (movie.playhead.rate() == rate) return;
  movie.playhead.setRate(rate, when);
  changed(describe(movie));
}

void MoviePlayer::step(Movie& movie, int frames) {
  movie.playhead.setRate(0);
  movie.playhead.seek(std::clamp<Nanoseconds>(movie.playhead.position() + frames * kFrame, 0, movie.length));
  changed(std::string("steps ") + (frames > 0 ? "forward" : "back") + " in \"" + movie.title + '"');
}

Value MoviePlayer::read(const ObjectRef& object, tarnscript::Code property) {
  if (property == words::kViewerFullScreen) return fullScreen_;
  const Movie& movie = movieOf(object);
  switch (property) {
    case words::kName:
      return movie.title;
    case words::kRate:
      return movie.playhead.rate();
    case words::kPlaying:
      return movie.playhead.rate() != 0;
    case words::kVolume:
      return movie.volume;
    case words::kCurrentTime:
      return inSeconds(movie.playhead.position());
    case words::kDuration:
      return inSeconds(movie.length);
    default:
      return Application::read(object, property);
  }
}

void MoviePlayer::write(const ObjectRef& object, tarnscript::Code property, const Value& value) {
  if (property == words::kViewerFullScreen) {
    fullScreen_ = tarnscript::toInt32(value) != 0;
    changed(fullScreen_ ? "full screen on" : "full screen off");
    return;
  }
  Movie& movie = movieOf(object);
  switch (property) {
    case words::kRate:
      setRate(movie, numberOf(value));
      break;
    case words::kVolume: {
      const double previous = std::exchange(movie.volume, std::clamp(numberOf(value), 0.0, loudest_));
      if (movie.volume != previous)
        changed("volume " + numberText(previous) + " → " + numberText(movie.volume));
      break;
    }
    case words::kCurrentTime: {
      const double held = std::clamp(numberOf(value), 0.0, inSeconds(movie.length));
      movie.playhead.seek(static_cast<Nanoseconds>(held * static_cast<double>(kSecond)));
      changed("goes to " + positionText(movie.playhead.position()));
      break;
    }
    default:
      Application::write(object, property, value);
  }
}

std::vector<ObjectRef> MoviePlayer::list(const ObjectRef& object, tarnscript::Code cls) {
  if (object.cls != tarnscript::kApplicationClass || cls != words::kDocument)
    return Application::list(object, cls);
  std::vector<ObjectRef> movies;
  for (const Movie& movie : movies_) movies.push_back({this, words::kDocument, movie.id});
  return movies;
}

Value MoviePlayer::obey(const tarnscript::Event& event) {
  const auto* const direct = event.direct ? std::get_if<ObjectRef>(&*event.direct) : nullptr;
  Movie& movie = movieOf(direct != nullptr ? *direct : event.target);
  switch (event.command) {
    case words::kPlay:
      if (movie.playhead.position() >= movie.length) movie.playhead.seek(0);
      setRate(movie, 1);
      break;
    case words::kPause:
      setRate(movie, 0);
      break;
    case words::kStop:
      movie.playhead.seek(0);
      setRate(movie, 0);
      break;
    case words::kStepForward:
      step(movie, 1);
      break;
    case words::kStepBackward:
      step(movie, -1);
      break;
    case words::kShowRemoteHUD:
      changed("shows its remote display");
      break;
    case words::kClose:
      changed("closes \"" + movie.title + '"');
      std::erase_if(movies_, [id = movie.id](const Movie& open) { return open.id == id; });
      break;
    default:
      return Application::obey(event);
  }
  return {};
}

}  // namespace stage
