#include "platform/scripting/script.h"

#include <memory>
#include <utility>

#include "platform/base/values.h"

namespace {

struct ScriptObject final : HostObject {
  static constexpr base::Kind kKind = base::Kind::Script;
  explicit ScriptObject(std::string text) : HostObject(kKind), source(std::move(text)) {}
  const std::string source;
  /// Filled in by the first run that compiles.
  std::unique_ptr<tarnscript::Script> compiled;
};

scripting::Hooks sHooks;

tarnscript::Outcome run(ScriptObject& script) {
  tarnscript::Outcome outcome;
  if (script.compiled == nullptr) {
    tarnscript::Error error;
    script.compiled = tarnscript::Script::compile(script.source, *sHooks.world, error);
    if (script.compiled == nullptr) {
      outcome.error = error;
      return outcome;
    }
  }
  return script.compiled->run(*sHooks.world);
}

HostDictionaryRef errorRecord(const tarnscript::Error& error) {
  auto* message = new base::String(error.message);
  auto* line = new base::Number(std::int64_t{error.line});
  auto* record = new base::Dictionary({{"message", message}, {"line", line}});
  return HostDictionaryRef(base::makeTemporary(record));
}

}  // namespace

void scripting::setHooks(Hooks hooks) { sHooks = std::move(hooks); }

HostScriptRef HostCreateScript(HostStringRef source) {
  if (!source || sHooks.world == nullptr) return nullptr;
  return HostScriptRef(new ScriptObject(base::textOf(source)));
}

HostDescriptorRef HostExecuteScript(HostScriptRef script, HostDictionaryRef* error) {
  auto* const object = base::as<ScriptObject>(script);
  if (object == nullptr) return nullptr;
  if (sHooks.started) sHooks.started(object->source);
  const tarnscript::Outcome outcome = run(*object);
  if (sHooks.ended) sHooks.ended(outcome);
  if (outcome.error) {
    if (error != nullptr) *error = errorRecord(*outcome.error);
    return nullptr;
  }
  auto* const result =
      new base::Descriptor(tarnscript::toInt32(outcome.value), tarnscript::toTypeCode(outcome.value));
  return HostDescriptorRef(base::makeTemporary(result));
}
