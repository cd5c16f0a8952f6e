#include "platform/terminal/last_target.h"

#include <utility>

#include "platform/base/run_loop.h"
#include "platform/stage/application.h"
#include "platform/terminal/catalogue.h"
#include "platform/terminal/text.h"
#include "routing/target.h"

namespace terminal {

void LastTarget::note(const stage::JournalLine& line) {
  // What a timer does in a later turn of the loop is no longer about the choice.
  if (choosing_ && base::turn() != turn_) settle();
  if (line.question == stage::Question::WhoIsInFront && sTargetApplication == App::Nval) {
    choosing_ = true;
    turn_ = base::turn();
    choice_.begin(line.about != nullptr ? line.about->identifier : "");
  } else if (line.question == stage::Question::WhoRuns) {
    choice_.noteAsked(line.about->identifier);
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

void LastTarget::conclude(AppCode target) {
  const stage::Application* const application = applicationOf(target);
  const telling::Reason reason = choice_.conclude(application != nullptr ? application->identifier : "");
  text_ = widen(application != nullptr ? application->name : "nobody") + L": " +
          widen(telling::wordsFor(reason, target));
}

}  // namespace terminal
