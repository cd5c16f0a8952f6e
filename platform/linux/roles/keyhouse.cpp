#include "platform/linux/roles/keyhouse.h"

#include <string>
#include <utility>

#include "platform/linux/programs/own_words.h"
#include "platform/linux/roles/perform.h"
#include "platform/linux/roles/posted_keys.h"
#include "platform/scripting/keyhouse_dictionary.h"

namespace linux::roles {

namespace {

namespace keyhouse = scripting::keyhouse;
using programs::Instance;
using tarnscript::Event;
using tarnscript::ObjectRef;
using tarnscript::Refusal;
using tarnscript::Value;

constexpr std::pair<tarnscript::Code, windows::Modifier> kModifiers[] = {
    {keyhouse::kShiftDown, windows::kShift},
    {keyhouse::kOptionDown, windows::kAlt},
    {keyhouse::kControlDown, windows::kControl},
};

std::uint64_t idOf(const HostProcessSerialNumber& process) {
  return std::uint64_t{process.high} << 32 | process.low;
}

HostProcessSerialNumber processOf(std::uint64_t id) {
  return {static_cast<std::uint32_t>(id >> 32), static_cast<std::uint32_t>(id)};
}

class Keyhouse final : public tarnscript::Application {
 public:
  const tarnscript::Dictionary& dictionary() const override { return keyhouse::dictionary(); }
  bool running() const override { return true; }
  void launch() override {}
  void activate() override {}
  void deliver(bool) override {}
  Value get(const ObjectRef&, tarnscript::Code) override { throw Refusal{"keys have no properties"}; }
  void set(const ObjectRef&, tarnscript::Code, const Value&) override {
    throw Refusal{"keys have no properties"};
  }
  std::vector<ObjectRef> elements(const ObjectRef&, tarnscript::Code) override {
    throw Refusal{"processes are named by their identifiers"};
  }

  ObjectRef elementWithID(const ObjectRef&, tarnscript::Code, const Value& id) override {
    const auto* const identifier = std::get_if<std::string>(&id);
    const programs::Role role = identifier != nullptr ? programs::roleOf(*identifier) : programs::Role::None;
    const Instance* const first = programs::firstInstance(role);
    if (first == nullptr) throw Refusal{"there is no such process"};
    return {this, keyhouse::kProcess, idOf(first->serialNumber)};
  }

  Value perform(const Event& event) override {
    if (!event.direct) throw Refusal{"there is no key"};
    const Instance* const receiver = event.target.cls == keyhouse::kProcess
                                         ? programs::findInstance(processOf(event.target.id))
                                         : programs::frontInstance();
    if (receiver == nullptr) throw Refusal{"nobody takes the key"};
    const auto used = event.parameters.find(keyhouse::kUsing);
    press(Performer(*receiver), static_cast<std::uint16_t>(tarnscript::toInt32(*event.direct)),
          used != event.parameters.end() ? tarnscript::toTypeCode(used->second) : 0);
    return {};
  }

 private:
  static void press(const Performer& receiver, std::uint16_t virtualKey, tarnscript::Code modifier) {
    if (modifier == keyhouse::kCommandDown) {
      // No keyboard here has that key: the one shortcut in use has rows of its own.
      if (virtualKey != HostVirtualKey::Escape) throw Refusal{"there is no such key"};
      return roles::perform(receiver, programs::words::kCommandEscape);
    }
    windows::Modifiers modifiers = windows::kNoModifier;
    for (const auto& [code, held] : kModifiers) {
      if (code == modifier) modifiers = held;
    }
    releaseKey(pressKey(receiver, virtualKey, modifiers), virtualKey, modifiers);
  }
};

}  // namespace

tarnscript::Application& keyhouse() {
  static Keyhouse theKeyhouse;
  return theKeyhouse;
}

}  // namespace linux::roles
