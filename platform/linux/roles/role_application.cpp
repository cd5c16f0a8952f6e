#include "platform/linux/roles/role_application.h"

#include "platform/linux/roles/deeds.h"
#include "platform/linux/programs/launch.h"

namespace desktop {

namespace {

[[noreturn]] void refuse() { throw tarnscript::Refusal{"the program cannot do that"}; }

}  // namespace

bool RoleApplication::running() const { return firstInstance(role_) != nullptr; }

void RoleApplication::launch() {
  if (!running()) launchProgramOf(role_);
}

void RoleApplication::activate() {
  const Instance* const first = firstInstance(role_);
  if (first != nullptr) {
    bringToFront(*first);
  } else {
    launchProgramOf(role_);
  }
}

void RoleApplication::deliver(bool) {}

tarnscript::Value RoleApplication::get(const tarnscript::ObjectRef&, tarnscript::Code) { refuse(); }

void RoleApplication::set(const tarnscript::ObjectRef&, tarnscript::Code, const tarnscript::Value&) {
  refuse();
}

std::vector<tarnscript::ObjectRef> RoleApplication::elements(const tarnscript::ObjectRef&, tarnscript::Code) {
  refuse();
}

tarnscript::ObjectRef RoleApplication::elementWithID(const tarnscript::ObjectRef&, tarnscript::Code,
                                                     const tarnscript::Value&) {
  refuse();
}

tarnscript::Value RoleApplication::perform(const tarnscript::Event& event) {
  desktop::perform(instance(), event.command);
  return {};
}

const Instance& RoleApplication::instance() const {
  const Instance* const first = firstInstance(role_);
  if (first == nullptr) throw tarnscript::Refusal{"it does not run"};
  return *first;
}

Player& RoleApplication::player() const {
  Player* const player = playerOf(instance());
  if (player == nullptr) throw tarnscript::Refusal{"its player is not on the bus"};
  return *player;
}

}  // namespace desktop
