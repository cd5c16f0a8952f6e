#include "platform/screen/lessons.h"

#include <algorithm>

#include "daemon/kvd.h"
#include "platform/screen/catalogue.h"

namespace live {

namespace {

using stage::Application;
using stage::Desktop;

enum Lesson : std::size_t { Open, Front, Play, Pause, Other, Volume, Graduated };

bool plays(const Application& application) {
  return application.running() && application.nextChange().has_value();
}

/// The application that the first lessons are about: one that is there, else the disc player.
const Application* subject(const Desktop& desktop) {
  if (desktop.front) return desktop.front->application;
  if (!desktop.running.empty()) return desktop.running.front().application;
  return stage::findApplication(Bundle::Spindle);
}

/// One that has not played yet.
const Application* other(const std::set<const Application*>& played) {
  for (const char* const identifier : {Bundle::Lyrabox, Bundle::Spindle}) {
    const Application* const found = stage::findApplication(identifier);
    if (found != nullptr && !played.contains(found)) return found;
  }
  return nullptr;
}

/// The digit that stands for it.
std::string digit(const Desktop& desktop, const Application& application) {
  const auto applications = openable(desktop);
  return std::to_string(std::ranges::find(applications, &application) - applications.begin() + 1);
}

}  // namespace

void Lessons::observe(const Desktop& desktop) {
  if (loudness_ < 0) loudness_ = desktop.outputVolume;
  for (const auto& application : desktop.installed) {
    if (plays(*application)) {
      played_.insert(application.get());
    } else if (application->running() && played_.contains(application.get())) {
      paused_ = true;
    }
  }
  while (lesson_ < Graduated && learnt(desktop)) ++lesson_;
}

bool Lessons::learnt(const Desktop& desktop) const {
  switch (lesson_) {
    case Open:
      return !desktop.running.empty();
    case Front:
      return desktop.front.has_value() || !played_.empty();
    case Play:
      return !played_.empty();
    case Pause:
      return paused_;
    case Other:
      return played_.size() > 1;
    default:
      return desktop.outputVolume != loudness_;
  }
}

std::string Lessons::hint(const Desktop& desktop) const {
  const Application* const about = lesson_ == Other ? other(played_) : subject(desktop);
  const std::string key = about != nullptr ? digit(desktop, *about) : "a digit";
  const std::string name = about != nullptr ? about->name : "an application";
  switch (lesson_) {
    case Open: {
      const std::string role(about != nullptr ? roleOf(*about) : "");
      return "Press " + key + " to open " + name + (role.empty() ? "." : ", the " + role + ".");
    }
    case Front:
      return "Press " + key + " again: " + name + " comes to the front, where the buttons go first.";
    case Play:
      return "Press Space, which is Play/Pause on the remote, and read below what kvd does.";
    case Pause:
      return "Something plays. Press Space again to pause it.";
    case Other:
      return "Let it play again (Space), then " + key + ", " + key + ", Space: " + name +
             " plays, the other stops.";
    case Volume:
      return "Press + for louder. Or hold it: type :hold volume-up 3s and Enter.";
    default:
      return "Try the arrows, other applications, kvremote in another terminal. ? lists the keys.";
  }
}

}  // namespace live
