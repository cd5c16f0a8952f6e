#include "platform/telling/choice.h"

namespace telling {

std::string_view wordsFor(Reason reason, AppCode target) {
  switch (reason) {
    case Reason::InFront:
      return "it is in front";
    case Reason::Plays:
      return target == App::Spin ? "it plays or shows its menu" : "it plays";
    case Reason::ChosenLast:
      return "it was chosen last";
    case Reason::RunsFirst:
      return "it is the first player that runs";
    case Reason::Nobody:
      break;
  }
  return "no player is in front, plays or runs";
}

void Choice::begin(std::string_view front) {
  front_ = front;
  asked_.clear();
}

void Choice::noteAsked(std::string_view application) { ++asked_[std::string(application)]; }

Reason Choice::reasonFor(std::string_view target) const {
  if (target.empty()) return Reason::Nobody;
  if (target == front_) return Reason::InFront;
  const auto asked = asked_.find(target);
  if (asked != asked_.end() && asked->second == 1) return Reason::Plays;
  return target == remembered_ ? Reason::ChosenLast : Reason::RunsFirst;
}

Reason Choice::conclude(std::string_view target) {
  const Reason reason = reasonFor(target);
  if (reason == Reason::InFront || reason == Reason::Plays) remembered_ = target;
  if (reason == Reason::RunsFirst || reason == Reason::Nobody) remembered_.clear();
  return reason;
}

}  // namespace telling
