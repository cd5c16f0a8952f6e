#include "report/held_world.h"

#include <algorithm>
#include <charconv>
#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

#include "platform/linux/programs/own_words.h"
#include "platform/linux/roles/world.h"
#include "platform/scripting/additions_dictionary.h"
#include "platform/scripting/keyhouse_dictionary.h"
#include "platform/scripting/movie_dictionaries.h"
#include "platform/scripting/slidewell_dictionary.h"
#include "platform/text/case.h"
#include "report/deeds.h"
#include "report/names.h"

namespace report {

namespace {

namespace keyhouse = scripting::keyhouse;
namespace programs = linux::programs;
using programs::Instance;
using programs::Role;
using tarnscript::Application;
using tarnscript::Code;
using tarnscript::ObjectRef;
using tarnscript::Value;

/// The words that a dictionary's table has for a code.
template <typename Terms>
std::string wordsIn(const Terms& terms, Code code) {
  const auto term = std::ranges::find_if(terms, [&](const auto& each) { return each.code == code; });
  return term != terms.end() ? std::string(term->words) : "?";
}

struct Describe {
  const tarnscript::Dictionary& dictionary;

  std::string operator()(bool value) const { return value ? "true" : "false"; }
  std::string operator()(std::int64_t value) const { return std::to_string(value); }
  std::string operator()(double value) const {
    char text[32];
    return {text, std::to_chars(text, text + sizeof text, value).ptr};
  }
  std::string operator()(const std::string& value) const { return '"' + value + '"'; }
  std::string operator()(tarnscript::Constant value) const {
    return wordsIn(dictionary.constants, value.code);
  }
  std::string operator()(const ObjectRef& value) const {
    const std::string words = wordsIn(dictionary.classes, value.cls);
    // A movie player has one, and a show two that can be asked for.
    if (value.cls == scripting::movies::kDocument) return words;
    if (value.cls == scripting::slidewell::kSlide) return (value.id == 1 ? "first " : "last ") + words;
    return words + " " + std::to_string(value.id);
  }
  template <typename Other>
  std::string operator()(const Other&) const {
    return "?";
  }
};

/// One application. The engine asks the application of an object, so that objects bear this one's address
/// outside and the real one's inside.
class Held final : public Application {
 public:
  Held(Application& real, Role role) : real_(real), role_(role) {}

  const tarnscript::Dictionary& dictionary() const override { return real_.dictionary(); }
  bool running() const override { return real_.running(); }
  void deliver(bool waitsForReply) override { real_.deliver(waitsForReply); }

  void launch() override {
    if (!running()) noteStart(role_);
  }
  void activate() override {
    const Instance* const first = programs::firstInstance(role_);
    first != nullptr ? noteFor(*first, "come to the front", 0) : noteStart(role_);
  }

  Value get(const ObjectRef& object, Code property) override {
    return outward(real_.get(inward(object), property));
  }
  std::vector<ObjectRef> elements(const ObjectRef& object, Code cls) override {
    auto found = real_.elements(inward(object), cls);
    for (ObjectRef& each : found) each = swapped(each, &real_, this);
    return found;
  }
  ObjectRef elementWithID(const ObjectRef& object, Code cls, const Value& id) override {
    return swapped(real_.elementWithID(inward(object), cls, id), &real_, this);
  }

  void set(const ObjectRef& object, Code property, const Value& value) override {
    noteFor(performer(), "set " + propertyWords(object, property) + " to " + describe(value), property);
  }
  Value perform(const tarnscript::Event& event) override {
    if (event.command == scripting::additions::kGetVolumeSettings) return real_.perform(event);
    if (event.command == scripting::additions::kSetVolume) {
      noteVolume(event);
    } else if (event.command == keyhouse::kKeyCode) {
      noteKeyCode(event);
    } else {
      std::string words = wordsIn(dictionary().commands, event.command);
      if (event.direct) words += " " + describe(*event.direct);
      noteFor(performer(), std::move(words), event.command);
    }
    return {};
  }

 private:
  static ObjectRef swapped(ObjectRef object, const Application* from, Application* to) {
    if (object.application == from) object.application = to;
    return object;
  }
  ObjectRef inward(const ObjectRef& object) { return swapped(object, this, &real_); }
  Value outward(Value value) {
    if (auto* const object = std::get_if<ObjectRef>(&value)) *object = swapped(*object, &real_, this);
    if (auto* const list = std::get_if<tarnscript::List>(&value); list != nullptr && *list != nullptr) {
      std::vector<Value> values = **list;
      for (Value& each : values) each = outward(std::move(each));
      return std::make_shared<const std::vector<Value>>(std::move(values));
    }
    return value;
  }

  std::string describe(const Value& value) const {
    return std::visit(Describe{dictionary()}, static_cast<const Value::variant&>(value));
  }
  std::string propertyWords(const ObjectRef& object, Code property) const {
    for (const tarnscript::PropertyTerm& term : dictionary().properties) {
      if (term.owner == object.cls && term.code == property) return std::string(term.words);
    }
    return "?";
  }

  const Instance& performer() const {
    const Instance* const first = programs::firstInstance(role_);
    if (first == nullptr) throw tarnscript::Refusal{"it does not run"};
    return *first;
  }

  static void noteVolume(const tarnscript::Event& event) {
    const auto [volume, muted] = scripting::additions::volumeChange(event);
    std::string words;
    if (volume) words = "output volume to " + std::to_string(*volume);
    if (muted) words = *muted ? "mute the output" : "no longer muted";
    note({Role::None, "the desktop", 0, words, {}});
  }

  /// To the process that the script names, else to the program in front.
  void noteKeyCode(const tarnscript::Event& event) const {
    const Instance* const receiver =
        event.target.cls == keyhouse::kProcess
            ? programs::findInstance({static_cast<std::uint32_t>(event.target.id >> 32),
                                      static_cast<std::uint32_t>(event.target.id)})
            : programs::frontInstance();
    if (receiver == nullptr) throw tarnscript::Refusal{"nobody takes the key"};
    const auto virtualKey = static_cast<std::uint16_t>(event.direct ? tarnscript::toInt32(*event.direct) : 0);
    const auto used = event.parameters.find(keyhouse::kUsing);
    const Code modifier = used != event.parameters.end() ? tarnscript::toTypeCode(used->second) : 0;
    if (modifier != keyhouse::kCommandDown)
      return noteKey(*receiver, virtualKey, modifier == keyhouse::kShiftDown);
    noteFor(*receiver, "key Command+" + keyName(virtualKey, false), programs::words::kCommandEscape);
  }

  Application& real_;
  const Role role_;
};

class World final : public tarnscript::World {
 public:
  Application* find(std::string_view identifierOrName) override {
    Application* const real = linux::roles::world().find(identifierOrName);
    return real != nullptr ? &held(*real, roleNamed(identifierOrName)) : nullptr;
  }
  Application& additions() override { return held(linux::roles::world().additions(), Role::None); }

 private:
  /// Scripts write identifiers in any case.
  static Role roleNamed(std::string_view name) {
    const auto* const role = std::ranges::find_if(programs::kRoles, [&](Role each) {
      return text::equalIgnoringCase(programs::bundleIdentifier(each), name);
    });
    return role != std::end(programs::kRoles) ? *role : Role::None;
  }

  Held& held(Application& real, Role role) {
    auto& held = held_[&real];
    if (held == nullptr) held = std::make_unique<Held>(real, role);
    return *held;
  }

  std::map<Application*, std::unique_ptr<Held>> held_;
};

}  // namespace

tarnscript::World& heldWorld() {
  static World world;
  return world;
}

}  // namespace report
