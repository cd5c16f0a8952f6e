#include "platform/stage/application.h"

#include <utility>

#include "platform/stage/desktop.h"
#include "platform/stage/journal.h"

namespace stage {

namespace {

using tarnscript::Code;
using tarnscript::ObjectRef;
using tarnscript::Value;

constexpr tarnscript::Dictionary kNoWords{};

[[noreturn]] void refuse(const Application& application) {
  throw tarnscript::Refusal{application.name + " does not understand this"};
}

}  // namespace

Application::Application(std::string bundleIdentifier, std::string displayName, std::string bundleVersion)
    : identifier(std::move(bundleIdentifier)),
      name(std::move(displayName)),
      version(std::move(bundleVersion)) {}

Application::Application(const scripting::Identity& identity, std::string bundleVersion)
    : Application(identity.identifier, identity.name, std::move(bundleVersion)) {}

const tarnscript::Dictionary& Application::dictionary() const { return kNoWords; }

void Application::launch() {
  if (!running()) openApplication(*this);
}

void Application::activate() {
  launch();
  bringToFront(*this);
}

void Application::deliver(bool waitsForReply) {
  if (waitsForReply && hangsUntil > now()) {
    desktop().waitedFor = this;
    pass(hangsUntil - now());
    desktop().waitedFor = nullptr;
  }
  if (manner == Manner::Refuses) throw tarnscript::Refusal{name + " refuses"};
  advance();
}

Value Application::get(const ObjectRef& object, Code property) {
  return manner == Manner::Ignores ? Value{} : read(object, property);
}

void Application::set(const ObjectRef& object, Code property, const Value& value) {
  if (manner != Manner::Ignores) write(object, property, value);
}

std::vector<ObjectRef> Application::elements(const ObjectRef& object, Code cls) {
  return manner == Manner::Ignores ? std::vector<ObjectRef>{} : list(object, cls);
}

ObjectRef Application::elementWithID(const ObjectRef& object, Code cls, const Value& id) {
  return manner == Manner::Ignores ? object : find(object, cls, id);
}

Value Application::perform(const tarnscript::Event& event) {
  return manner == Manner::Ignores ? Value{} : obey(event);
}

void Application::receiveEvent(std::uint32_t, std::uint32_t) {}

void Application::receiveKey(std::uint16_t, bool) {}

Value Application::read(const ObjectRef&, Code) { refuse(*this); }

void Application::write(const ObjectRef&, Code, const Value&) { refuse(*this); }

std::vector<ObjectRef> Application::list(const ObjectRef&, Code) { refuse(*this); }

ObjectRef Application::find(const ObjectRef&, Code, const Value&) { refuse(*this); }

Value Application::obey(const tarnscript::Event&) { refuse(*this); }

void Application::changed(const std::string& what) const { record(Entry::Change, name + ": " + what); }

}  // namespace stage
