#include "platform/stage/application.h"

#include <utility>

#include "platform/stage/desktop.h"
#include "platform/stage/journal.h"

namespace stage {

namespace {

constexpr tarnscript::Dictionary kNoWords{};

[[noreturn]] void refuse(const Application& application) {
  throw tarnscript::Refusal{application.name + " does not understand this"};
}

}  // namespace

Application::Application(std::string bundleIdentifier, std::string displayName, std::string bundleVersion)
    : identifier(std::move(bundleIdentifier)),
      name(std::move(displayName)),
      version(std::move(bundleVersion)) {}

const tarnscript::Dictionary& Application::dictionary() const { return kNoWords; }

void Application::launch() {
  if (!running()) openApplication(*this);
}

void Application::activate() {
  launch();
  bringToFront(*this);
}

void Application::deliver(bool waitsForReply) {
  if (waitsForReply && hangsUntil > now()) pass(hangsUntil - now());
  advance();
}

tarnscript::Value Application::get(const tarnscript::ObjectRef&, tarnscript::Code) { refuse(*this); }

void Application::set(const tarnscript::ObjectRef&, tarnscript::Code, const tarnscript::Value&) {
  refuse(*this);
}

std::vector<tarnscript::ObjectRef> Application::elements(const tarnscript::ObjectRef&, tarnscript::Code) {
  refuse(*this);
}

tarnscript::ObjectRef Application::elementWithID(const tarnscript::ObjectRef&, tarnscript::Code,
                                                 const tarnscript::Value&) {
  refuse(*this);
}

tarnscript::Value Application::perform(const tarnscript::Event&) { refuse(*this); }

void Application::receiveEvent(std::uint32_t, std::uint32_t) {}

void Application::changed(const std::string& what) const { record(Entry::Change, name + ": " + what); }

}  // namespace stage
