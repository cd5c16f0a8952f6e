#include "platform/stage/lyrabox.h"

#include <algorithm>
#include <iterator>

#include "platform/scripting/lyrabox_dictionary.h"
#include "platform/stage/quantities.h"

namespace stage {

namespace {

namespace words = scripting::lyrabox;
using tarnscript::Constant;
using tarnscript::ObjectRef;
using tarnscript::Value;

struct Track {
  const char* name;
  int seconds;
};

constexpr Track kTracks[] = {
    {"Harbour Lights", 214}, {"Paper Boats", 187}, {"Slow Train North", 245},
    {"Lantern Street", 201}, {"Last Ferry", 232},
};

constexpr int kScanSpeed = 8;
/// Back track restarts a track that has played for longer than this.
constexpr Nanoseconds kRestartThreshold = 3 * kSecond;

constexpr std::uint32_t kHookClass = words::code("hook");
constexpr std::uint32_t kRemoteSelectEvent = words::code("RSel");

}  // namespace

Lyrabox::Lyrabox() : Application(scripting::kLyrabox, "4.2") {}

const tarnscript::Dictionary& Lyrabox::dictionary() const { return words::dictionary(); }

double Lyrabox::rateOf(State state) {
  switch (state) {
    case State::Playing:
      return 1;
    case State::FastForwarding:
      return kScanSpeed;
    case State::Rewinding:
      return -kScanSpeed;
    case State::Stopped:
    case State::Paused:
      break;
  }
  return 0;
}

ObjectRef Lyrabox::track(std::size_t index) { return {this, words::kTrack, index + 1}; }

Nanoseconds Lyrabox::duration() const { return kTracks[current_].seconds * kSecond; }

std::optional<Nanoseconds> Lyrabox::nextChange() const { return playhead_.arrival(duration()); }

void Lyrabox::advance() {
  for (auto end = nextChange(); end && *end <= now(); end = nextChange()) {
    if (playhead_.rate() > 0) {
      nextTrack(*end);
    } else {
      playhead_.seek(0, *end);
      enter(beforeScan_, *end);
    }
  }
}

std::string Lyrabox::describe() const {
  const std::string title = std::string("\"") + kTracks[current_].name + '"';
  switch (state_) {
    case State::Stopped:
      return "stopped";
    case State::Playing:
      return "plays " + title;
    case State::Paused:
      return "paused in " + title + " at " + positionText(playhead_.position());
    case State::FastForwarding:
      return "scans forward through " + title;
    case State::Rewinding:
      return "scans back through " + title;
  }
  return {};
}

std::string Lyrabox::details() const {
  const std::string volume = "volume " + std::to_string(volume_);
  if (state_ == State::Stopped) return volume;
  return positionText(playhead_.position()) + "/" + positionText(duration()) + ", " + volume;
}

void Lyrabox::enter(State state, Nanoseconds when) {
  if (state == state_) return;
  state_ = state;
  playhead_.setRate(rateOf(state), when);
  changed(describe());
}

void Lyrabox::scan(State direction) {
  if (state_ == State::Stopped) return;
  if (!scanning()) beforeScan_ = state_;
  enter(direction);
}

void Lyrabox::goTo(std::size_t index, Nanoseconds when) {
  current_ = index;
  playhead_.seek(0, when);
  changed(state_ == State::Stopped ? std::string("chooses \"") + kTracks[current_].name + '"' : describe());
}

void Lyrabox::nextTrack(Nanoseconds when) {
  if (current_ + 1 < std::size(kTracks)) return goTo(current_ + 1, when);
  current_ = 0;
  stop();
}

void Lyrabox::backTrack() {
  const bool restart = playhead_.position() > kRestartThreshold || current_ == 0;
  goTo(restart ? current_ : current_ - 1);
}

void Lyrabox::stop() {
  playhead_.seek(0);
  enter(State::Stopped);
}

Value Lyrabox::read(const ObjectRef& object, tarnscript::Code property) {
  if (object.cls == words::kTrack) {
    const Track& item = kTracks[object.id - 1];
    if (property == words::kName) return std::string(item.name);
    return static_cast<double>(item.seconds);
  }
  switch (property) {
    case words::kPlayerState: {
      switch (state_) {
        case State::Stopped:
          return Constant{words::kStopped};
        case State::Playing:
          return Constant{words::kPlaying};
        case State::Paused:
          return Constant{words::kPaused};
        case State::FastForwarding:
          return Constant{words::kFastForwarding};
        case State::Rewinding:
          return Constant{words::kRewinding};
      }
      break;
    }
    case words::kPlayerPosition:
      return inSeconds(playhead_.position());
    case words::kSoundVolume:
      return std::int64_t{volume_};
    case words::kCurrentTrack:
      return track(current_);
    default:
      break;
  }
  return Application::read(object, property);
}

void Lyrabox::write(const ObjectRef& object, tarnscript::Code property, const Value& value) {
  if (object.cls != tarnscript::kApplicationClass) throw tarnscript::Refusal{"tracks cannot be changed"};
  if (property == words::kSoundVolume) {
    const int previous = volume_;
    volume_ = std::clamp(tarnscript::toInt32(value), 0, 100);
    if (volume_ != previous) {
      changed("volume " + std::to_string(previous) + " → " + std::to_string(volume_));
    }
    return;
  }
  if (property == words::kPlayerPosition) {
    const auto* seconds = std::get_if<double>(&value);
    if (seconds == nullptr) throw tarnscript::Refusal{"a position is a number of seconds"};
    const double held = std::clamp(*seconds, 0.0, inSeconds(duration()));
    playhead_.seek(static_cast<Nanoseconds>(held * static_cast<double>(kSecond)));
    changed("goes to " + positionText(playhead_.position()));
    return;
  }
  throw tarnscript::Refusal{"this property cannot be set"};
}

std::vector<ObjectRef> Lyrabox::list(const ObjectRef& object, tarnscript::Code cls) {
  if (object.cls != tarnscript::kApplicationClass || cls != words::kTrack) {
    return Application::list(object, cls);
  }
  std::vector<ObjectRef> tracks;
  for (std::size_t i = 0; i < std::size(kTracks); ++i) tracks.push_back(track(i));
  return tracks;
}

ObjectRef Lyrabox::find(const ObjectRef& object, tarnscript::Code cls, const Value& id) {
  const auto* number = std::get_if<std::int64_t>(&id);
  for (const ObjectRef& item : list(object, cls)) {
    if (number != nullptr && static_cast<std::int64_t>(item.id) == *number) return item;
  }
  throw tarnscript::Refusal{"there is no such track"};
}

Value Lyrabox::obey(const tarnscript::Event& event) {
  switch (event.command) {
    case words::kPlay: {
      if (event.direct) {
        const auto* wanted = std::get_if<ObjectRef>(&*event.direct);
        if (wanted == nullptr || wanted->application != this || wanted->cls != words::kTrack) {
          throw tarnscript::Refusal{"only tracks can be played"};
        }
        current_ = wanted->id - 1;
        stop();
      }
      enter(State::Playing);
      break;
    }
    case words::kPause:
      if (state_ != State::Stopped) enter(State::Paused);
      break;
    case words::kPlayPause:
      enter(state_ == State::Playing || scanning() ? State::Paused : State::Playing);
      break;
    case words::kStop:
      stop();
      break;
    case words::kResume:
      if (scanning()) enter(beforeScan_);
      break;
    case words::kFastForward:
      scan(State::FastForwarding);
      break;
    case words::kRewind:
      scan(State::Rewinding);
      break;
    case words::kNextTrack:
      nextTrack();
      break;
    case words::kBackTrack:
      backTrack();
      break;
    default:
      return Application::obey(event);
  }
  return {};
}

void Lyrabox::receiveEvent(std::uint32_t eventClass, std::uint32_t eventID) {
  if (eventClass != kHookClass || eventID != kRemoteSelectEvent) return;
  advance();
  playhead_.seek(0);
  if (state_ == State::Playing) {
    changed("starts \"" + std::string(kTracks[current_].name) + "\" again");
  } else {
    enter(State::Playing);
  }
}

void Lyrabox::ended() {
  state_ = State::Stopped;
  playhead_ = {};
}

}  // namespace stage
