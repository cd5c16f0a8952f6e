#include "report/button.h"

#include <algorithm>
#include <span>
#include <string>
#include <utility>
#include <vector>

#include "daemon/kvd.h"
#include "platform/base/failure.h"
#include "platform/base/run_loop.h"
#include "platform/linux/host/listener.h"
#include "platform/linux/players/mpris.h"
#include "platform/linux/programs/running.h"
#include "platform/linux/roles/world.h"
#include "platform/scripting/script.h"
#include "platform/tarnscript/tarnscript.h"
#include "platform/telling/choice.h"
#include "report/deeds.h"
#include "report/held_world.h"
#include "report/names.h"
#include "routing/dispatcher.h"
#include "routing/retrigger.h"
#include "routing/target.h"

namespace report {

namespace {

namespace host = linux::host;
namespace programs = linux::programs;
using programs::Instance;
using programs::Role;
using telling::Reason;

/// The players, of whom a running kvd chooses the last one when nobody is in front or plays.
constexpr Role kPlayers[] = {Role::Jukebox, Role::DiscPlayer, Role::ClassicMovies, Role::ModernMovies};

/// Names by which programs know the rules.
constexpr std::pair<Reason, const char*> kReasons[] = {
    {Reason::Nobody, "nobody"},          {Reason::InFront, "front"},           {Reason::Plays, "playing"},
    {Reason::ChosenLast, "chosen-last"}, {Reason::RunsFirst, "first-running"},
};

/// What became of the button.
struct Outcome {
  AppCode target = App::Nval;
  Reason reason = Reason::Nobody;
  std::vector<Deed> pressed, released;
  bool repeats = false;
};

/// For as long as it lives the core's questions are listened to and scripts do nothing.
class Rehearsal {
 public:
  Rehearsal(telling::Choice& choice, bool& repeats) {
    host::setListener({
        .whoIsInFront =
            [&choice](Role front) {
              if (sTargetApplication == App::Nval) choice.begin(programs::bundleIdentifier(front));
            },
        .whoRuns = [&choice](Role role) { choice.noteAsked(programs::bundleIdentifier(role)); },
    });
    scripting::setHooks({.world = &heldWorld(), .started = nullptr, .ended = nullptr});
    base::setTimerObserver([&repeats](const base::Timer&, bool started) { repeats |= started; });
    // The pauses between keys, none of which is pressed.
    base::setTimeSource({.now = nullptr, .wait = nullptr, .sleep = [](base::Nanoseconds) {}});
  }
  ~Rehearsal() {
    stopRetrigger();
    host::setListener({});
    scripting::setHooks({.world = &linux::roles::world(), .started = nullptr, .ended = nullptr});
    base::setTimerObserver(nullptr);
    base::setTimeSource({});
  }
  Rehearsal(const Rehearsal&) = delete;
  Rehearsal& operator=(const Rehearsal&) = delete;
};

Outcome rehearse(const remote::Button& button) {
  Outcome outcome;
  telling::Choice choice;
  const Rehearsal rehearsal(choice, outcome.repeats);
  const PackedHIDEvent event = PackHIDEvent({button.usagePage, button.usage, 0});
  for (const std::int32_t value : remote::tapValues(button)) {
    DispatchHIDEvent(event, value, false);
    (value != remote::kReleased ? outcome.pressed : outcome.released) = takeDeeds();
    if (value == remote::kReleased) continue;
    outcome.target = sTargetApplication;
    outcome.reason = choice.conclude(programs::bundleIdentifier(roleOf(outcome.target)));
  }
  return outcome;
}

bool plays(const Instance& instance) {
  linux::players::Player* const player = programs::playerOf(instance);
  try {
    return player != nullptr && statusOf(*player) == linux::players::PlaybackStatus::Playing;
  } catch (const tarnscript::Refusal&) {
    return false;
  }
}

bool isSoundKey(const Deed& deed) { return deed.role == Role::None; }

Object describe(const Deed& deed) {
  Object object{{"program", deed.program}, {"process", deed.process}, {"words", deed.words}};
  object["ways"] = deed.ways;
  return object;
}

/// Those of the deeds that are for the target and the desktop, or those that are for others.
Object describe(const std::vector<Deed>& deeds, Role target, bool others) {
  Object list = Object::array();
  for (const Deed& deed : deeds) {
    const bool isOther = target != Role::None && deed.role != Role::None && deed.role != target;
    if (isOther == others) list.push_back(describe(deed));
  }
  return list;
}

/// What a running kvd may know better, and what goes without saying for the core.
Object remarksOn(const Outcome& outcome, const Instance* target) {
  Object remarks = Object::array();
  const auto otherRuns = [&](Role role) {
    return role != roleOf(outcome.target) && programs::isPlayed(role);
  };
  if (outcome.reason == Reason::RunsFirst && std::ranges::any_of(kPlayers, otherRuns)) {
    remarks.push_back(
        "A running kvd remembers the player that was in front or played at an earlier button and would "
        "choose that one first; this program cannot know it.");
  }
  if (target != nullptr) {
    const auto inRole = programs::rankedInstances(target->role);
    const bool known = inRole.front() == programs::frontInstance() || plays(*inRole.front());
    if (inRole.size() > 1 && !known) {
      remarks.push_back(
          "Several programs of this kind run. A running kvd takes the one that last played or was told "
          "something; this program cannot know that and takes the one that was started last.");
    }
    for (const Instance* other : inRole) {
      if (other == target || outcome.pressed.empty() || !plays(*other)) continue;
      remarks.push_back("Where it begins to play, " + nameOf(*other) + " (" + std::to_string(other->process) +
                        "), which plays too, is paused: one of a kind at a time.");
    }
  }
  const bool starts = outcome.target == App::None && !outcome.pressed.empty();
  if (starts && !isSoundKey(outcome.pressed.front())) {
    remarks.push_back("Not while the screen is locked.");
  }
  return remarks;
}

}  // namespace

Object describeButton(const remote::Button& button) {
  Object object{{"button", button.name}};
  gKVDConnection = HostConnectWindowServer();
  if (gKVDConnection == 0) {
    object["reason"] = "no-session";
    object["why"] = "kvd does not start: " + base::lastFailure();
    return object;
  }
  const Outcome outcome = rehearse(button);
  const Role role = roleOf(outcome.target);
  const Instance* const target = programs::firstInstance(role);
  const bool volume = std::ranges::any_of(outcome.pressed, isSoundKey);
  object["target"] = nullptr;
  if (target != nullptr && !volume) {
    object["target"] = {{"program", nameOf(*target)}, {"process", target->process}, {"role", wordsFor(role)}};
  }
  if (volume) {
    object["reason"] = "volume";
    object["why"] = "a volume button, whoever plays";
  } else {
    const auto* const row =
        std::ranges::find(kReasons, outcome.reason, &std::pair<Reason, const char*>::first);
    object["reason"] = row->second;
    object["why"] = telling::wordsFor(outcome.reason, outcome.target);
  }
  object["silenced"] = describe(outcome.pressed, role, true);
  object["told"] = describe(outcome.pressed, role, false);
  object["released"] = describe(outcome.released, role, false);
  object["repeats"] = outcome.repeats;
  object["remarks"] = remarksOn(outcome, volume ? nullptr : target);
  return object;
}

}  // namespace report
