#include "platform/terminal/lessons.h"

#include <algorithm>

#include "daemon/kvd.h"
#include "platform/terminal/catalogue.h"

namespace terminal {

namespace {

using stage::Application;
using stage::Desktop;

enum Lesson : std::size_t { Play, Pause, Resume, Other, Volume, Graduated };

/// The players, the two that the lessons like best first: a film, then music.
constexpr const char* kPlayers[] = {Bundle::Spindle, Bundle::Lyrabox, Bundle::VistremePlayer,
                                    Bundle::VistremePlayerX};

bool plays(const Application& application) {
  return application.running() && application.nextChange().has_value();
}

bool anyPlays(const std::set<const Application*>& applications) {
  return std::ranges::any_of(applications,
                             [](const Application* application) { return plays(*application); });
}

/// The player that a lesson is about: one that has not played yet, best the one in front, or one that runs.
const Application* playerFor(const Desktop& desktop, const std::set<const Application*>& played) {
  const Application* chosen = nullptr;
  int best = -1;
  for (const char* const identifier : kPlayers) {
    const Application* const player = stage::findApplication(identifier);
    if (player == nullptr || played.contains(player)) continue;
    const bool inFront = desktop.front && desktop.front->application == player;
    const int rank = inFront ? 2 : player->running() ? 1 : 0;
    if (rank > best) {
      best = rank;
      chosen = player;
    }
  }
  return chosen;
}

/// The digit that stands for it.
std::string digit(const Desktop& desktop, const Application& application) {
  const auto applications = openable(desktop);
  return std::to_string(std::ranges::find(applications, &application) - applications.begin() + 1);
}

/// The next step on the way to a player that is there, in front, and gets the button.
std::string wayTo(const Desktop& desktop, const Application* player, const std::string& inTheEnd) {
  if (player == nullptr) return inTheEnd;
  const std::string key = digit(desktop, *player);
  if (!player->running())
    return "Press " + key + " to open " + player->name + ", the " + std::string(roleOf(*player)) + ".";
  if (!desktop.front || desktop.front->application != player)
    return "Press " + key + " again: " + player->name + " comes to the front, where buttons go first.";
  return inTheEnd;
}

}  // namespace

void Lessons::observe(const Desktop& desktop) {
  if (loudness_ < 0) loudness_ = desktop.outputVolume;
  for (const auto& application : desktop.installed) {
    if (plays(*application)) played_.insert(application.get());
  }
  while (lesson_ < Graduated && learnt(desktop)) ++lesson_;
}

bool Lessons::learnt(const Desktop& desktop) const {
  switch (lesson_) {
    case Play:
      return !played_.empty();
    case Pause:
      return !anyPlays(played_) || played_.size() > 1;
    case Resume:
      return anyPlays(played_);
    case Other:
      return played_.size() > 1;
    default:
      return desktop.outputVolume != loudness_;
  }
}

std::string Lessons::hint(const Desktop& desktop) const {
  switch (lesson_) {
    case Play:
      return wayTo(desktop, playerFor(desktop, {}),
                   "Press Space, the remote's Play/Pause, and see what kvd asks and does.");
    case Pause:
      return "Something plays. Press Space again to pause it.";
    case Resume:
      return "Space once more lets it play on.";
    case Other:
      return wayTo(desktop, playerFor(desktop, played_),
                   "Press Space: this one plays, and kvd stops what played.");
    case Volume:
      return "Press +: the volume goes up, and on while the button is held.";
    default:
      return "Try other applications; e makes one fail, 0 leaves none in front; ? tells all.";
  }
}

}  // namespace terminal
