// The keystroke helper: keys for one running program, or for the one in front.

#include "platform/scripting/keyhouse_dictionary.h"

#include <string>
#include <utility>

#include "platform/linux/deeds.h"
#include "platform/linux/own_words.h"
#include "platform/linux/posted_keys.h"
#include "platform/linux/role_application.h"

namespace desktop {

namespace {

namespace keyhouse = scripting::keyhouse;
using tarnscript::Event;
using tarnscript::ObjectRef;
using tarnscript::Refusal;
using tarnscript::Value;

constexpr std::pair<tarnscript::Code, std::uint16_t> kModifiers[] = {
    {keyhouse::kShiftDown, kShift},
    {keyhouse::kOptionDown, kAlt},
    {keyhouse::kControlDown, kControl},
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
    const Role role = identifier != nullptr ? roleOf(*identifier) : Role::None;
    const Instance* const first = role != Role::None ? firstInstance(role) : nullptr;
    if (first == nullptr) throw Refusal{"there is no such process"};
    return {this, keyhouse::kProcess, idOf(first->serialNumber)};
  }

  Value perform(const Event& event) override {
    if (!event.direct) throw Refusal{"there is no key"};
    const Instance* const receiver =
        event.target.cls == keyhouse::kProcess ? findInstance(processOf(event.target.id)) : frontInstance();
    if (receiver == nullptr) throw Refusal{"nobody takes the key"};
    const auto used = event.parameters.find(keyhouse::kUsing);
    press(*receiver, static_cast<std::uint16_t>(tarnscript::toInt32(*event.direct)),
          used != event.parameters.end() ? tarnscript::toTypeCode(used->second) : 0);
    return {};
  }

 private:
  static void press(const Instance& receiver, std::uint16_t virtualKey, tarnscript::Code modifier) {
    if (modifier == keyhouse::kCommandDown) {
      // No keyboard here has that key: the one shortcut in use has rows of its own.
      if (virtualKey != HostVirtualKey::Escape) throw Refusal{"there is no such key"};
      return desktop::perform(receiver, words::kCommandEscape);
    }
    std::uint16_t modifiers = kNoModifier;
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

}  // namespace desktop
