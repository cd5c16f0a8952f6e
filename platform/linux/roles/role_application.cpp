#include "platform/linux/roles/role_application.h"

#include "platform/linux/programs/launch.h"
#include "platform/linux/roles/perform.h"

namespace linux::roles {

namespace {

using tarnscript::Code;
using tarnscript::ObjectRef;
using tarnscript::Value;

[[noreturn]] void refuse() { throw tarnscript::Refusal{"the program cannot do that"}; }

}  // namespace

bool RoleApplication::running() const { return programs::isPlayed(role_); }

void RoleApplication::launch() {
  if (!running()) programs::launchProgramOf(role_);
}

void RoleApplication::activate() {
  if (const auto first = performerOf(role_)) {
    programs::bringToFront(first->instance());
  } else {
    programs::launchProgramOf(role_);
  }
}

void RoleApplication::deliver(bool) {}

Value RoleApplication::get(const ObjectRef& object, Code property) {
  return getBy(performer(), object, property);
}

void RoleApplication::set(const ObjectRef& object, Code property, const Value& value) {
  const Performer spokenTo = performer();
  programs::noteSpokenTo(spokenTo.instance());
  setBy(spokenTo, object, property, value);
}

std::vector<ObjectRef> RoleApplication::elements(const ObjectRef& object, Code cls) {
  return elementsBy(performer(), object, cls);
}

ObjectRef RoleApplication::elementWithID(const ObjectRef&, Code, const Value&) { refuse(); }

Value RoleApplication::perform(const tarnscript::Event& event) {
  const Performer spokenTo = performer();
  programs::noteSpokenTo(spokenTo.instance());
  return performBy(spokenTo, event);
}

Value RoleApplication::getBy(const Performer&, const ObjectRef&, Code) { refuse(); }

void RoleApplication::setBy(const Performer&, const ObjectRef&, Code, const Value&) { refuse(); }

std::vector<ObjectRef> RoleApplication::elementsBy(const Performer&, const ObjectRef&, Code) { refuse(); }

Value RoleApplication::performBy(const Performer& performer, const tarnscript::Event& event) {
  roles::perform(performer, event.command);
  return {};
}

Performer RoleApplication::performer() const {
  auto first = performerOf(role_);
  if (!first) throw tarnscript::Refusal{"it does not run"};
  return *std::move(first);
}

}  // namespace linux::roles
