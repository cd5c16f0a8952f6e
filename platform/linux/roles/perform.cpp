#include "platform/linux/roles/deeds.h"
#include "platform/linux/players/gtk_actions.h"
#include "platform/linux/windows/keystrokes.h"
#include "platform/linux/players/mpv_channel.h"
#include "platform/linux/players/vlc_channel.h"

namespace desktop {

namespace {

bool isFor(const Deed& deed, const Instance& instance) {
  if (deed.program == nullptr) return true;
  return instance.program != nullptr && std::string_view(deed.program) == instance.program->entry;
}

/// Whether some row is written for this very program; then those for any other do not count.
bool hasRowsOfItsOwn(const Instance& instance, tarnscript::Code word) {
  for (const Deed& deed : deeds()) {
    if (deed.role == instance.role && deed.word == word && deed.program != nullptr && isFor(deed, instance)) {
      return true;
    }
  }
  return false;
}

/// False when the row's way is not open on this program.
bool carryOut(const Deed& deed, const Instance& instance) {
  switch (deed.means) {
    case Means::Mpris: {
      Player* const player = playerOf(instance);
      if (player == nullptr) return false;
      invoke(*player, deed.how);
      return true;
    }
    case Means::Mpv:
      if (!hasMpvChannel(instance.process)) return false;
      mpvCommand(instance.process, deed.how);
      return true;
    case Means::Rc:
      if (!hasVlcChannel(instance.process)) return false;
      vlcCommand(instance.process, deed.how);
      return true;
    case Means::Action:
      return activateAction(instance, deed.how);
    case Means::Key:
      return type(instance, deed.how);
    case Means::Nothing:
      return true;
    case Means::Code:
      return false;
  }
  return false;
}

}  // namespace

void perform(const Instance& instance, tarnscript::Code word) {
  const bool own = hasRowsOfItsOwn(instance, word);
  for (const Deed& deed : deeds()) {
    if (deed.role != instance.role || deed.word != word || own != (deed.program != nullptr)) continue;
    if (isFor(deed, instance) && carryOut(deed, instance)) return;
  }
  throw tarnscript::Refusal{"the program has no way to do that"};
}

}  // namespace desktop
