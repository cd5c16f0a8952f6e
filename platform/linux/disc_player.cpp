// The disc player: discs with menus and chapters, and plain files as if they had some.

#include <algorithm>
#include <cmath>
#include <iterator>

#include "platform/linux/keystrokes.h"
#include "platform/linux/playback.h"
#include "platform/linux/role_application.h"
#include "platform/linux/scan.h"
#include "platform/linux/vlc_channel.h"
#include "platform/scripting/spindle_dictionary.h"

namespace desktop {

namespace {

namespace words = scripting::spindle;
using tarnscript::Constant;
using tarnscript::ObjectRef;
using tarnscript::Refusal;
using tarnscript::Value;

/// The volume in the words of scripts.
constexpr double kFullVolume = 255;

/// How a chapter is gone to.
enum class Way : std::uint8_t {
  Channel,   ///< by its number, over VLC's channel
  Keys,      ///< one on or back, by VLC's keys: it does not tell where it stands
  PlayList,  ///< one on or back in the play list
  None,      ///< a menu has no chapters
};

/// A chapter, counted from 1, and how many there are.
struct Chapter {
  int number;
  int count;
  Way way;
};

/// Where a film was left for the menu.
struct Place {
  pid_t process = 0;
  int title = 1;
  std::int64_t seconds = 0;
};

std::int64_t secondsOf(std::int64_t microseconds) { return microseconds / 1'000'000; }

bool isDisc(const PlayerState& state) {
  constexpr std::string_view kSchemes[] = {"dvd:", "dvdsimple:", "bluray:", "vcd:"};
  return std::any_of(std::begin(kSchemes), std::end(kSchemes),
                     [&](std::string_view scheme) { return state.url.starts_with(scheme); });
}

class DiscPlayer final : public RoleApplication {
 public:
  DiscPlayer() : RoleApplication(Role::DiscPlayer) {}

  const tarnscript::Dictionary& dictionary() const override { return words::dictionary(); }
  Value get(const ObjectRef& object, tarnscript::Code property) override;
  void set(const ObjectRef& object, tarnscript::Code property, const Value& value) override;
  Value perform(const tarnscript::Event& event) override;

 private:
  bool showsMenu(const PlayerState& state) const;
  words::Code discState() const;
  Chapter chapter(const PlayerState& state) const;
  void goToChapter(int wanted) const;
  void scanAt(double direction) const;
  void goToMenu(const tarnscript::Event& event);
  void returnToFilm() const;
  void goToBeginning() const;
  void stop() const;

  words::Code scanRate_ = words::kX2;
  Place left_;
};

/// Without its channel VLC does not tell.
bool DiscPlayer::showsMenu(const PlayerState& state) const {
  if (!isDisc(state) || state.status == PlaybackStatus::Stopped) return false;
  const auto title = vlcTitle(instance().process);
  return title && title->number == 0 && title->count > 0;
}

bool hasMedia(Player& player, const PlayerState& state) {
  return state.status != PlaybackStatus::Stopped || !state.url.empty() || !trackListOf(player).empty();
}

words::Code DiscPlayer::discState() const {
  const PlayerState state = stateOf(player());
  if (scanRate(player())) return words::kPlaying;
  if (!hasMedia(player(), state)) return words::kIdle;
  // Behind a menu the film stands still.
  if (state.status == PlaybackStatus::Stopped || showsMenu(state)) return words::kStopped;
  return state.status == PlaybackStatus::Playing ? words::kPlaying : words::kPaused;
}

/// The entries of the play list as chapters: the one before, this one, the one after.
Chapter placeInPlayList(Player& player, const PlayerState& state) {
  bool before = state.canGoPrevious;
  bool after = state.canGoNext;
  // VLC says that it can always go on and back.
  const auto tracks = trackListOf(player);
  const auto current = std::find(tracks.begin(), tracks.end(), state.trackID);
  if (current != tracks.end()) {
    before = current != tracks.begin();
    after = std::next(current) != tracks.end();
  }
  const int number = before ? 2 : 1;
  return {number, number + (after ? 1 : 0), Way::PlayList};
}

Chapter DiscPlayer::chapter(const PlayerState& state) const {
  if (showsMenu(state)) return {1, 1, Way::None};
  const auto told = vlcChapter(instance().process);
  if (told && told->count > 1) return {told->number + 1, told->count, Way::Channel};
  if (isDisc(state) && instance().program != nullptr) return {2, 3, Way::Keys};
  return placeInPlayList(player(), state);
}

void DiscPlayer::goToChapter(int wanted) const {
  const PlayerState state = stateOf(player());
  const Chapter now = chapter(state);
  if (wanted < 1 || wanted > now.count || now.way == Way::None) throw Refusal{"there is no such chapter"};
  endFastPlaying(player());
  const bool onward = wanted > now.number;
  if (wanted == now.number && (wanted == 1 || now.way != Way::Channel)) {
    seekTo(player(), state, 0);
  } else if (now.way == Way::PlayList) {
    invoke(player(), onward ? "Next" : "Previous");
  } else if (now.way == Way::Keys) {
    type(instance(), onward ? "Shift+n" : "Shift+p");
  } else if (state.status == PlaybackStatus::Playing) {
    vlcCommand(instance().process, "chapter " + std::to_string(wanted - 1));
  } else {
    // A paused VLC takes no numbers.
    vlcCommand(instance().process, onward ? "key key-chapter-next" : "key key-chapter-prev");
  }
}

void DiscPlayer::scanAt(double direction) const {
  if (showsMenu(stateOf(player()))) return;
  playAtRate(instance(), direction * *words::rateOf(scanRate_));
}

void DiscPlayer::goToMenu(const tarnscript::Event& event) {
  const PlayerState state = stateOf(player());
  // A disc begins with its menu.
  if (state.status == PlaybackStatus::Stopped) return startPlaying(instance());
  if (!isDisc(state)) throw Refusal{"there is no menu"};
  const auto title = vlcTitle(instance().process);
  if (title && title->number > 0) left_ = {instance().process, title->number, secondsOf(state.position)};
  endFastPlaying(player());
  RoleApplication::perform(event);
  // A paused VLC shows no buttons.
  startPlaying(instance());
}

void DiscPlayer::returnToFilm() const {
  const pid_t process = instance().process;
  if (!showsMenu(stateOf(player()))) return;
  const Place place = left_.process == process ? left_ : Place{};
  vlcCommand(process, "title " + std::to_string(place.title));
  vlcCommand(process, "seek " + std::to_string(place.seconds));
  startPlaying(instance());
}

/// A disc is put in anew, so to speak, and plays: what it shows first is for the disc to say.
void DiscPlayer::goToBeginning() const {
  const PlayerState state = stateOf(player());
  if (!hasMedia(player(), state)) throw Refusal{"there is no disc"};
  // What is stopped begins there anyway.
  if (state.status == PlaybackStatus::Stopped) return;
  endFastPlaying(player());
  if (isDisc(state) && !state.trackID.empty()) return goToTrack(player(), state.trackID);
  seekTo(player(), state, 0);
}

/// A menu that was paused would show no buttons when one comes back to it.
void DiscPlayer::stop() const {
  if (showsMenu(stateOf(player()))) {
    desktop::stop(player());
  } else {
    endPlaying(instance());
  }
}

Value DiscPlayer::get(const ObjectRef& object, tarnscript::Code property) {
  if (property == words::kScanRate) return Constant{scanRate_};
  if (property == words::kState) return Constant{discState()};
  const PlayerState state = stateOf(player());
  switch (property) {
    case words::kChapter:
      return std::int64_t{chapter(state).number};
    case words::kAvailableChapters:
      return std::int64_t{chapter(state).count};
    case words::kElapsedTime:
      return secondsOf(state.position);
    case words::kMenuActive:
      return showsMenu(state);
    case words::kActiveMenu:
      return Constant{showsMenu(state) ? words::kMainMenu : words::kNoMenu};
    case words::kHasMedia:
      return hasMedia(player(), state);
    case words::kAudioVolume:
      return static_cast<std::int64_t>(std::lround(std::min(state.volume, 1.0) * kFullVolume));
    case words::kViewerFullScreen:
      if (const auto fullscreen = fullscreenOf(player())) return *fullscreen;
      break;
    default:
      break;
  }
  return RoleApplication::get(object, property);
}

void DiscPlayer::set(const ObjectRef& object, tarnscript::Code property, const Value& value) {
  switch (property) {
    case words::kScanRate: {
      const words::Code wanted = tarnscript::toTypeCode(value);
      if (words::rateOf(wanted)) scanRate_ = wanted;
      return;
    }
    case words::kChapter:
      return goToChapter(tarnscript::toInt32(value));
    case words::kAudioVolume:
      return setVolume(player(), std::clamp(tarnscript::toInt32(value) / kFullVolume, 0.0, 1.0));
    case words::kViewerFullScreen:
      return setFullscreen(player(), tarnscript::toInt32(value) != 0);
    default:
      RoleApplication::set(object, property, value);
  }
}

Value DiscPlayer::perform(const tarnscript::Event& event) {
  switch (event.command) {
    case words::kPlayDVD:
      startPlaying(instance());
      break;
    case words::kPauseDVD:
      endPlaying(instance());
      break;
    case words::kStopDVD:
      stop();
      break;
    case words::kFastForwardDVD:
      scanAt(1);
      break;
    case words::kRewindDVD:
      scanAt(-1);
      break;
    case words::kGoToMainMenu:
      goToMenu(event);
      break;
    case words::kGoReturn:
      returnToFilm();
      break;
    case words::kGoToBeginning:
      goToBeginning();
      break;
    default:
      return RoleApplication::perform(event);
  }
  return {};
}

}  // namespace

tarnscript::Application& discPlayer() {
  static DiscPlayer application;
  return application;
}

}  // namespace desktop
