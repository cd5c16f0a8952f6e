#include "platform/linux/roles/performer.h"

#include "platform/linux/programs/connections.h"
#include "platform/linux/windows/keystrokes.h"
#include "platform/tarnscript/tarnscript.h"

namespace linux::roles {

Performer::Performer(const programs::Instance& instance)
    : instance_(&instance), player_(programs::playerOf(instance)) {}

players::Player& Performer::player() const {
  if (player_ == nullptr) throw tarnscript::Refusal{"its player is not on the bus"};
  return *player_;
}

const players::ProgramChannel* Performer::channel() const {
  if (program() == nullptr) return nullptr;
  const players::ProgramChannel* const channel = players::channelOf(program()->channel);
  return channel != nullptr && !system::channelPath(listener()).empty() ? channel : nullptr;
}

system::Listener Performer::listener() const {
  return {instance_->process, program() != nullptr ? program()->executable : ""};
}

const std::vector<windows::Window>& Performer::windows() const {
  if (!windows_) windows_ = lookAtWindows();
  return *windows_;
}

std::vector<windows::Window> Performer::lookAtWindows() const {
  std::vector<windows::Window> looked = windows::look(instance_->windows);
  if (instance_->connection.empty() || program() == nullptr) return looked;
  if (looked.empty()) {
    windows::Window& unseen = looked.emplace_back();
    unseen.applicationID = program()->entry;
    unseen.className = program()->windowClass;
    unseen.process = instance_->process;
  }
  for (windows::Window& window : looked) {
    if (!window.gtk.busName.empty()) continue;
    window.gtk = programs::gtkNamesOf(*program(), instance_->connection);
    window.process = instance_->process;
  }
  return looked;
}

const windows::Window* Performer::keyboardWindow() const { return windows::keyboardWindow(windows()); }

Performer Performer::in(const windows::Window& window) const {
  Performer narrowed = *this;
  narrowed.windows_ = {window};
  return narrowed;
}

std::optional<Performer> performerOf(programs::Role role) {
  const programs::Instance* const first = programs::firstInstance(role);
  if (first == nullptr) return std::nullopt;
  return Performer(*first);
}

}  // namespace linux::roles
