#include "platform/stage/script_world.h"

#include "platform/scripting/additions_dictionary.h"
#include "platform/scripting/script.h"
#include "platform/stage/desktop.h"
#include "platform/stage/four_char_code.h"
#include "platform/stage/journal.h"
#include "platform/stage/quantities.h"

namespace stage {

namespace {

namespace words = scripting::additions;
using tarnscript::Value;

/// The output volume, as a commands-only application that always runs.
class Additions final : public Application {
 public:
  Additions() : Application("", "the desktop", "") {}
  const tarnscript::Dictionary& dictionary() const override { return words::dictionary(); }
  bool running() const override { return true; }

 protected:
  Value obey(const tarnscript::Event& event) override;
};

Value Additions::obey(const tarnscript::Event& event) {
  if (event.command == words::kGetVolumeSettings) {
    return words::volumeSettings(desktop().outputVolume, desktop().outputMuted);
  }
  if (event.command != words::kSetVolume) return Application::obey(event);
  const auto [volume, muted] = words::volumeChange(event);
  if (volume) setOutputVolume(*volume);
  if (muted) setOutputMuted(*muted);
  return {};
}

class World final : public tarnscript::World {
 public:
  tarnscript::Application* find(std::string_view identifierOrName) override {
    return findApplication(identifierOrName);
  }
  tarnscript::Application& additions() override { return additions_; }

 private:
  Additions additions_;
};

World& world() {
  static World instance;
  return instance;
}

struct Describe {
  std::string operator()(std::monostate) const { return {}; }
  std::string operator()(bool value) const { return value ? "true" : "false"; }
  std::string operator()(std::int64_t value) const { return std::to_string(value); }
  std::string operator()(double value) const { return numberText(value); }
  std::string operator()(const std::string& value) const { return '"' + value + '"'; }
  std::string operator()(tarnscript::Constant value) const { return quoted(value.code); }
  std::string operator()(const tarnscript::ObjectRef& value) const {
    return quoted(value.cls) + " " + std::to_string(value.id);
  }
  std::string operator()(const tarnscript::List& value) const {
    return "a list of " + std::to_string(value->size());
  }
  std::string operator()(const tarnscript::Record&) const { return "a record"; }
};

}  // namespace

std::string describe(const Value& value) {
  return std::visit(Describe(), static_cast<const Value::variant&>(value));
}

void letScriptsFindApplications() {
  scripting::setHooks({
      &world(),
      recordScriptStart,
      [](const tarnscript::Outcome& outcome) {
        if (outcome.error) {
          recordScriptFailure(outcome.error->message, outcome.error->line);
        } else {
          recordScriptEnd(describe(outcome.value));
        }
      },
  });
}

tarnscript::Outcome runScript(const std::string& source) {
  tarnscript::Outcome outcome;
  tarnscript::Error error;
  const auto script = tarnscript::Script::compile(source, world(), error);
  if (script == nullptr) {
    outcome.error = error;
    return outcome;
  }
  return script->run(world());
}

}  // namespace stage
