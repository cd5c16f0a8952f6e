#include "platform/stage/keyhouse.h"

#include <string>

#include "platform/scripting/keyhouse_dictionary.h"
#include "platform/stage/desktop.h"
#include "platform/stage/journal.h"

namespace stage {

namespace {

namespace words = scripting::keyhouse;
using tarnscript::ObjectRef;
using tarnscript::Value;

struct Modifier {
  words::Code code;
  const char* name;
};

constexpr Modifier kModifiers[] = {
    {words::kCommandDown, "Command-"},
    {words::kShiftDown, "Shift-"},
    {words::kOptionDown, "Option-"},
    {words::kControlDown, "Control-"},
};

}  // namespace

const tarnscript::Dictionary& Keyhouse::dictionary() const { return words::dictionary(); }

ObjectRef Keyhouse::find(const ObjectRef& object, tarnscript::Code cls, const Value& id) {
  if (cls != words::kProcess) return Application::find(object, cls, id);
  const auto* const wanted = std::get_if<std::string>(&id);
  for (const Process& process : desktop().running) {
    if (wanted != nullptr && process.application->identifier == *wanted) {
      return {this, words::kProcess, process.serialNumber.low};
    }
  }
  throw tarnscript::Refusal{"there is no such process"};
}

Value Keyhouse::obey(const tarnscript::Event& event) {
  if (event.command != words::kKeyCode || !event.direct) return Application::obey(event);
  const auto key = static_cast<std::uint16_t>(tarnscript::toInt32(*event.direct));
  tarnscript::Code modifier = 0;
  const auto used = event.parameters.find(words::kUsing);
  if (used != event.parameters.end()) modifier = tarnscript::toTypeCode(used->second);
  std::string text = std::to_string(key);
  for (const Modifier& row : kModifiers) {
    if (row.code == modifier) text.insert(0, row.name);
  }

  // Outside a process the key goes where the keyboard goes.
  const Process* receiver = desktop().front ? &*desktop().front : nullptr;
  if (event.target.cls == words::kProcess) {
    receiver = findProcess({0, static_cast<std::uint32_t>(event.target.id)});
  }
  record(Entry::Key, "key " + text + " to " + (receiver != nullptr ? receiver->application->name : "nobody"));
  // None of the models has a shortcut with a modifier but Shift.
  const bool plain = modifier == 0 || modifier == words::kShiftDown;
  if (receiver != nullptr && plain) receiver->application->receiveKey(key, modifier == words::kShiftDown);
  return {};
}

}  // namespace stage
