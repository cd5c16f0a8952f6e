#include "platform/linux/roles/disc_player.h"

#include <algorithm>
#include <cmath>
#include <iterator>

#include "platform/linux/players/playback.h"
#include "platform/linux/players/scan.h"
#include "platform/linux/programs/own_words.h"
#include "platform/linux/roles/perform.h"
#include "platform/linux/roles/playing.h"
#include "platform/linux/roles/role_application.h"
#include "platform/scripting/spindle_dictionary.h"

namespace linux::roles {

namespace {

namespace words = scripting::spindle;
using players::Place;
using players::PlaybackStatus;
using players::Player;
using players::PlayerState;
using tarnscript::Constant;
using tarnscript::ObjectRef;
using tarnscript::Refusal;
using tarnscript::Value;

/// The volume in the words of scripts.
constexpr double kFullVolume = 255;

/// How a chapter is gone to.
enum class Way : std::uint8_t {
  Channel,   ///< by its number, over the program's channel
  Actions,   ///< one on or back, as its row says: it does not tell where it stands
  PlayList,  ///< one on or back in the play list
  None,      ///< a menu has no chapters
};

/// A chapter, and how another one is gone to.
struct Chapter {
  Place place;
  Way way = Way::None;
};

/// Where a film was left for the menu.
struct FilmPlace {
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

/// Nothing where the program has no channel that tells.
std::optional<Place> titleOf(const Performer& performer) {
  const players::ProgramChannel* const channel = performer.channel();
  if (channel == nullptr || channel->title == nullptr) return std::nullopt;
  return channel->title(performer.listener());
}

std::optional<Place> chapterTold(const Performer& performer) {
  const players::ProgramChannel* const channel = performer.channel();
  if (channel == nullptr || channel->chapter == nullptr) return std::nullopt;
  return channel->chapter(performer.listener());
}

/// The channel that has just told something; throws tarnscript::Refusal when it has closed since.
const players::ProgramChannel& requireChannel(const Performer& performer) {
  const players::ProgramChannel* const channel = performer.channel();
  if (channel == nullptr) throw Refusal{"its channel has closed"};
  return *channel;
}

/// False where the program does not tell.
bool showsMenu(const Performer& performer, const PlayerState& state) {
  if (!isDisc(state) || state.status == PlaybackStatus::Stopped) return false;
  const auto title = titleOf(performer);
  return title && title->number == 0 && title->count > 0;
}

bool hasMedia(Player& player, const PlayerState& state) {
  return state.status != PlaybackStatus::Stopped || !state.url.empty() ||
         !players::trackListOf(player).empty();
}

words::Code discState(const Performer& performer) {
  Player& player = performer.player();
  const PlayerState state = players::stateOf(player);
  if (players::scanRate(player)) return words::kPlaying;
  if (!hasMedia(player, state)) return words::kIdle;
  // Behind a menu the film stands still.
  if (state.status == PlaybackStatus::Stopped || showsMenu(performer, state)) return words::kStopped;
  return state.status == PlaybackStatus::Playing ? words::kPlaying : words::kPaused;
}

/// The entries of the play list as chapters: the one before, this one, the one after.
Chapter placeInPlayList(Player& player, const PlayerState& state) {
  bool before = state.canGoPrevious;
  bool after = state.canGoNext;
  // Some players say that they can always go on and back.
  const auto tracks = players::trackListOf(player);
  const auto current = std::find(tracks.begin(), tracks.end(), state.trackID);
  if (current != tracks.end()) {
    before = current != tracks.begin();
    after = std::next(current) != tracks.end();
  }
  const int number = before ? 2 : 1;
  return {{number, number + (after ? 1 : 0)}, Way::PlayList};
}

Chapter chapterOf(const Performer& performer, const PlayerState& state) {
  if (showsMenu(performer, state)) return {{1, 1}, Way::None};
  const auto told = chapterTold(performer);
  if (told && told->count > 1) return {*told, Way::Channel};
  if (isDisc(state) && programs::hasOwnAction(performer.program(), programs::words::kNextChapter)) {
    return {{2, 3}, Way::Actions};
  }
  return placeInPlayList(performer.player(), state);
}

void goToChapter(const Performer& performer, int wanted) {
  Player& player = performer.player();
  const PlayerState state = players::stateOf(player);
  const auto [now, way] = chapterOf(performer, state);
  if (wanted < 1 || wanted > now.count || way == Way::None) throw Refusal{"there is no such chapter"};
  players::endFastPlaying(player);
  const bool onward = wanted > now.number;
  if (wanted == now.number && (wanted == 1 || way != Way::Channel)) {
    players::seekTo(player, state, 0);
  } else if (way == Way::PlayList) {
    players::invoke(player, onward ? "Next" : "Previous");
  } else if (way == Way::Actions) {
    roles::perform(performer, onward ? programs::words::kNextChapter : programs::words::kPreviousChapter);
  } else {
    requireChannel(performer).goToChapter(performer.listener(), now.number, wanted,
                                          state.status == PlaybackStatus::Playing);
  }
}

/// A disc is put in anew, so to speak, and plays: what it shows first is for the disc to say.
void goToBeginning(const Performer& performer) {
  Player& player = performer.player();
  const PlayerState state = players::stateOf(player);
  if (!hasMedia(player, state)) throw Refusal{"there is no disc"};
  // What is stopped begins there anyway.
  if (state.status == PlaybackStatus::Stopped) return;
  players::endFastPlaying(player);
  if (isDisc(state) && !state.trackID.empty()) return players::goToTrack(player, state.trackID);
  players::seekTo(player, state, 0);
}

/// A menu that was paused would show no buttons when one comes back to it.
void stop(const Performer& performer) {
  if (showsMenu(performer, players::stateOf(performer.player()))) {
    players::stop(performer.player());
  } else {
    endPlaying(performer);
  }
}

class DiscPlayer final : public RoleApplication {
 public:
  DiscPlayer() : RoleApplication(programs::Role::DiscPlayer) {}

  const tarnscript::Dictionary& dictionary() const override { return words::dictionary(); }

 protected:
  Value getBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property) override;
  void setBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property,
             const Value& value) override;
  Value performBy(const Performer& performer, const tarnscript::Event& event) override;

 private:
  void scanAt(const Performer& performer, double direction) const;
  void goToMenu(const Performer& performer);
  void returnToFilm(const Performer& performer) const;

  words::Code scanRate_ = words::kX2;
  FilmPlace left_;
};

void DiscPlayer::scanAt(const Performer& performer, double direction) const {
  if (showsMenu(performer, players::stateOf(performer.player()))) return;
  playAtRate(performer, direction * *words::rateOf(scanRate_));
}

void DiscPlayer::goToMenu(const Performer& performer) {
  Player& player = performer.player();
  const PlayerState state = players::stateOf(player);
  // A disc begins with its menu.
  if (state.status == PlaybackStatus::Stopped) return startPlaying(performer);
  if (!isDisc(state)) throw Refusal{"there is no menu"};
  const auto title = titleOf(performer);
  if (title && title->number > 0) {
    left_ = {performer.instance().process, title->number, secondsOf(state.position)};
  }
  players::endFastPlaying(player);
  roles::perform(performer, words::kGoToMainMenu);
  // A paused player shows no buttons.
  startPlaying(performer);
}

void DiscPlayer::returnToFilm(const Performer& performer) const {
  if (!showsMenu(performer, players::stateOf(performer.player()))) return;
  const FilmPlace place = left_.process == performer.instance().process ? left_ : FilmPlace{};
  requireChannel(performer).goToTitle(performer.listener(), place.title, place.seconds);
  startPlaying(performer);
}

Value DiscPlayer::getBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property) {
  if (property == words::kScanRate) return Constant{scanRate_};
  if (property == words::kState) return Constant{discState(performer)};
  Player& player = performer.player();
  const PlayerState state = players::stateOf(player);
  switch (property) {
    case words::kChapter:
      return std::int64_t{chapterOf(performer, state).place.number};
    case words::kAvailableChapters:
      return std::int64_t{chapterOf(performer, state).place.count};
    case words::kElapsedTime:
      return secondsOf(state.position);
    case words::kMenuActive:
      return showsMenu(performer, state);
    case words::kActiveMenu:
      return Constant{showsMenu(performer, state) ? words::kMainMenu : words::kNoMenu};
    case words::kHasMedia:
      return hasMedia(player, state);
    case words::kAudioVolume:
      return static_cast<std::int64_t>(std::lround(std::min(state.volume, 1.0) * kFullVolume));
    case words::kViewerFullScreen:
      if (const auto fullscreen = players::fullscreenOf(player)) return *fullscreen;
      break;
    default:
      break;
  }
  return RoleApplication::getBy(performer, object, property);
}

void DiscPlayer::setBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property,
                       const Value& value) {
  switch (property) {
    case words::kScanRate: {
      const words::Code wanted = tarnscript::toTypeCode(value);
      if (words::rateOf(wanted)) scanRate_ = wanted;
      return;
    }
    case words::kChapter:
      return goToChapter(performer, tarnscript::toInt32(value));
    case words::kAudioVolume: {
      const double volume = tarnscript::toInt32(value) / kFullVolume;
      return players::setVolume(performer.player(), std::clamp(volume, 0.0, 1.0));
    }
    case words::kViewerFullScreen:
      return players::setFullscreen(performer.player(), tarnscript::toInt32(value) != 0);
    default:
      RoleApplication::setBy(performer, object, property, value);
  }
}

Value DiscPlayer::performBy(const Performer& performer, const tarnscript::Event& event) {
  switch (event.command) {
    case words::kPlayDVD:
      startPlaying(performer);
      break;
    case words::kPauseDVD:
      endPlaying(performer);
      break;
    case words::kStopDVD:
      stop(performer);
      break;
    case words::kFastForwardDVD:
      scanAt(performer, 1);
      break;
    case words::kRewindDVD:
      scanAt(performer, -1);
      break;
    case words::kGoToMainMenu:
      goToMenu(performer);
      break;
    case words::kGoReturn:
      returnToFilm(performer);
      break;
    case words::kGoToBeginning:
      goToBeginning(performer);
      break;
    default:
      return RoleApplication::performBy(performer, event);
  }
  return {};
}

}  // namespace

tarnscript::Application& discPlayer() {
  static DiscPlayer application;
  return application;
}

}  // namespace linux::roles
