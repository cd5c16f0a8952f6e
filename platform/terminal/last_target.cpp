#include "platform/terminal/last_target.h"

#include <utility>

#include "platform/base/run_loop.h"
#include "platform/stage/application.h"
#include "platform/terminal/catalogue.h"
#include "platform/terminal/text.h"
#include "routing/target.h"

namespace terminal {

using stage::Application;

void LastTarget::note(const stage::JournalLine& line) {
  // What a timer does in a later turn of the loop is no longer about the choice.
  if (choosing_ && base::turn() != turn_) settle();
  if (line.question == stage::Question::WhoIsInFront && sTargetApplication == App::Nval) {
    choosing_ = true;
    turn_ = base::turn();
    front_ = line.about;
    asked_.clear();
  } else if (line.question == stage::Question::WhoRuns) {
    ++asked_[line.about];
  } else if (line.kind == stage::Entry::SoundKey) {
    soundKey_ = true;
  }
}

void LastTarget::settle() {
  const bool chose = std::exchange(choosing_, false) && sTargetApplication != App::Nval;
  const bool changedVolume = std::exchange(soundKey_, false);
  if (chose) conclude(sTargetApplication);
  if (!changedVolume) return;
  if (sTargetApplication == App::Nval) {
    text_ = L"the output volume, whoever plays";
  } else if (chose) {
    text_ = L"the output volume; " + text_;
  }
}

LastTarget::Reason LastTarget::reasonFor(const Application* target) const {
  if (target == front_) return Reason::InFront;
  const auto asked = asked_.find(target);
  if (asked != asked_.end() && asked->second == 1) return Reason::Plays;
  return target == remembered_ ? Reason::ChosenLast : Reason::RunsFirst;
}

void LastTarget::conclude(AppCode target) {
  const Application* const application = applicationOf(target);
  if (application == nullptr) {
    remembered_ = nullptr;
    text_ = L"nobody: no player is in front, plays or runs";
    return;
  }
  text_ = widen(application->name) + L": ";
  switch (reasonFor(application)) {
    case Reason::InFront:
      remembered_ = application;
      text_ += L"it is in front";
      break;
    case Reason::Plays:
      remembered_ = application;
      text_ += target == App::Spin ? L"it plays or shows its menu" : L"it plays";
      break;
    case Reason::ChosenLast:
      text_ += L"it was chosen last";
      break;
    case Reason::RunsFirst:
      remembered_ = nullptr;
      text_ += L"it is the first player that runs";
  }
}

}  // namespace terminal
