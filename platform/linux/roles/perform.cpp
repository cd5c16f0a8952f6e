#include "platform/linux/roles/perform.h"

#include <algorithm>
#include <array>
#include <sstream>
#include <string>

#include "platform/linux/players/gtk_actions.h"
#include "platform/linux/players/mpris.h"
#include "platform/linux/windows/keystrokes.h"

namespace linux::roles {

namespace {

using programs::Means;

/// Calls "NAME PATH INTERFACE MEMBER TEXT", as Means::Method tells. False when nobody has that name.
bool callMethod(const programs::Instance& instance, const std::string& how) {
  std::istringstream words(how);
  std::string name, path, interface, member, argument;
  words >> name >> path >> interface >> member >> argument;
  const std::size_t at = name.find('%');
  if (name == "%") {
    name = instance.connection;
  } else if (at != std::string::npos) {
    name.replace(at, 1, std::to_string(instance.process));
  }
  if (name.empty() || !system::nameHasOwner(name.c_str())) return false;
  return system::send({name, instance.process}, {path.c_str(), interface.c_str(), member.c_str()},
                      argument.empty() ? "" : "s", argument.c_str());
}

/// False when the action's way is not open on this program.
bool carryOut(const programs::Action& action, const Performer& performer) {
  const windows::Window* window = nullptr;
  switch (action.means) {
    case Means::Mpris:
      if (performer.playerIfAny() == nullptr) return false;
      players::invoke(performer.player(), action.how);
      return true;
    case Means::Channel: {
      const players::ProgramChannel* const channel = performer.channel();
      if (channel == nullptr) return false;
      channel->command(performer.listener(), action.how);
      return true;
    }
    case Means::Action:
      window = performer.keyboardWindow();
      return window != nullptr && players::activateAction(*window, action.how);
    case Means::Method:
      return callMethod(performer.instance(), action.how);
    case Means::Key:
      window = performer.keyboardWindow();
      return window != nullptr && windows::type(window->id, action.how);
    case Means::Nothing:
      return true;
  }
  return false;
}

}  // namespace

void perform(const Performer& performer, tarnscript::Code word) {
  const auto actions = programs::actionsFor(performer.instance().role, performer.program(), word);
  const bool done =
      std::ranges::any_of(actions, [&](const auto& action) { return carryOut(action, performer); });
  if (!done) throw tarnscript::Refusal{"the program has no way to do that"};
}

}  // namespace linux::roles
