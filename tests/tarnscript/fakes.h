// A world for scripts: a player, a keystroke helper and the additions. All three are the same fake
// application with different words; it answers from tables and keeps a log of what reached it.
#pragma once

#include <algorithm>
#include <array>
#include <map>
#include <set>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

#include "platform/tarnscript/number_text.h"
#include "platform/tarnscript/tarnscript.h"
#include "platform/text/case.h"

namespace tarnscript {

inline std::string showCode(Code code) {
  return {static_cast<char>(code >> 24), static_cast<char>(code >> 16 & 0xFF),
          static_cast<char>(code >> 8 & 0xFF), static_cast<char>(code & 0xFF)};
}

/// A value as the tables of the tests write it.
inline std::string show(const Value& value) {
  if (const auto* boolean = std::get_if<bool>(&value)) return *boolean ? "true" : "false";
  if (const auto* integer = std::get_if<std::int64_t>(&value)) return toText(*integer);
  if (const auto* real = std::get_if<double>(&value)) return toText(*real);
  if (const auto* text = std::get_if<std::string>(&value)) return '"' + *text + '"';
  if (const auto* constant = std::get_if<Constant>(&value)) return '\'' + showCode(constant->code) + '\'';
  if (const auto* object = std::get_if<ObjectRef>(&value)) {
    return showCode(object->cls) + '#' + toText(static_cast<std::int64_t>(object->id));
  }
  if (const auto* list = std::get_if<List>(&value)) {
    std::string shown;
    for (const Value& element : **list) shown += (shown.empty() ? "{" : ", ") + show(element);
    return shown.empty() ? "{}" : shown + "}";
  }
  return std::holds_alternative<Record>(value) ? "record" : "none";
}

class FakeApplication : public Application {
 public:
  FakeApplication(const Dictionary& words, std::vector<std::string>& log) : words_(words), log_(log) {}

  const Dictionary& dictionary() const override { return words_; }
  bool running() const override { return runs; }
  void launch() override { start("launch"); }
  void activate() override { start("activate"); }
  void deliver(bool waitsForReply) override {
    if (hangs && waitsForReply) log_.emplace_back("stall");
  }
  Value get(const ObjectRef& object, Code property) override {
    const auto found = state.find({object.cls, object.id, property});
    if (found == state.end()) throw Refusal{"no such property"};
    return found->second;
  }
  void set(const ObjectRef& object, Code property, const Value& value) override {
    log_.push_back(showCode(property) + " of " + show(object) + " = " + show(value));
    state[{object.cls, object.id, property}] = value;
  }
  std::vector<ObjectRef> elements(const ObjectRef& object, Code cls) override {
    std::vector<ObjectRef> found;
    for (const std::uint64_t id : contents[{object.cls, cls}]) found.push_back({this, cls, id});
    return found;
  }
  ObjectRef elementWithID(const ObjectRef& /*object*/, Code cls, const Value& id) override {
    if (!std::holds_alternative<std::string>(id)) throw Refusal{"no such element"};
    return {this, cls, std::get<std::string>(id).size()};
  }
  Value perform(const Event& event) override {
    if (refused.contains(event.command)) throw Refusal{"refused"};
    std::string line = showCode(event.command) + " in " + show(event.target);
    if (event.direct) line += ": " + show(*event.direct);
    for (const auto& [code, value] : event.parameters) line += ' ' + showCode(code) + '=' + show(value);
    log_.push_back(line);
    const auto reply = replies.find(event.command);
    return reply == replies.end() ? Value{} : reply->second;
  }

  bool runs = true;
  bool hangs = false;
  std::map<std::tuple<Code, std::uint64_t, Code>, Value> state;
  /// The elements of a class in every object of another class.
  std::map<std::pair<Code, Code>, std::vector<std::uint64_t>> contents;
  std::map<Code, Value> replies;
  std::set<Code> refused;

 private:
  void start(const char* what) {
    log_.emplace_back(what);
    runs = true;
  }

  const Dictionary& words_;
  std::vector<std::string>& log_;
};

namespace words {

inline constexpr Code kApp = kApplicationClass;
inline constexpr Code kDoc = code("docu");
inline constexpr Code kAlbum = code("albm");
inline constexpr Code kKey = code("keyc");
inline constexpr Code kVolumeSettings = code("gvol");

inline constexpr auto kClasses = std::to_array<ClassTerm>({{"document", "documents", kDoc},
                                                           {"album", "albums", kAlbum},
                                                           {"chapter", "chapters", code("chap")},
                                                           {"slideshow", "slideshows", code("show")},
                                                           {"slide", "slides", code("slid")}});
inline constexpr auto kProperties =
    std::to_array<PropertyTerm>({{kApp, "player state", code("stat"), Type::Constant},
                                 {kApp, "sound volume", code("vol "), Type::Integer},
                                 {kApp, "play count", code("pcnt"), Type::Integer},
                                 {kApp, "frozen", code("froz"), Type::Boolean},
                                 {kApp, "chapter", code("chap"), Type::Integer},
                                 {kApp, "available chapters", code("chas"), Type::Integer},
                                 {kApp, "elapsed time", code("time"), Type::Integer},
                                 {kApp, "scan rate", code("scan"), Type::Constant},
                                 {kApp, "slideshow running", code("srun"), Type::Boolean},
                                 {kApp, "current album", code("cura"), Type::Object},
                                 {kApp, "name", code("pnam"), Type::Text},
                                 {kDoc, "name", code("pnam"), Type::Text},
                                 {kDoc, "rate", code("rate"), Type::Real},
                                 {kDoc, "playing", code("dply"), Type::Boolean},
                                 {kAlbum, "name", code("pnam"), Type::Text},
                                 {kAlbum, "id", code("ID  "), Type::Integer}});
inline constexpr auto kCommands = std::to_array<CommandTerm>({{"play", code("play"), true},
                                                              {"pause", code("paus"), true},
                                                              {"count", code("cnte"), true},
                                                              {"fast forward", code("ffwd"), false},
                                                              {"step forward", code("stpf"), true},
                                                              {"step backward", code("stpb"), true},
                                                              {"go to main menu", code("menu"), false},
                                                              {"show", code("show"), true},
                                                              {"show next slide", code("next"), false},
                                                              {"show remote hud", code("hud "), false},
                                                              {"start slideshow", code("strt"), false},
                                                              {"select", code("slct"), true}});
inline constexpr auto kConstants = std::to_array<ConstantTerm>(
    {{"playing", code("kPSP")}, {"paused", code("kPSp")}, {"x1", code("x1  ")}, {"x8", code("x8  ")}});
inline constexpr Dictionary kPlayer = {kClasses, kProperties, kCommands, {}, kConstants};

inline constexpr auto kHelperClasses = std::to_array<ClassTerm>({{"process", "processes", code("prcs")}});
inline constexpr auto kHelperCommands = std::to_array<CommandTerm>({{"key code", kKey, true}});
inline constexpr auto kHelperParameters =
    std::to_array<ParameterTerm>({{kKey, "using", code("usng"), Type::Constant}});
inline constexpr auto kHelperConstants =
    std::to_array<ConstantTerm>({{"command down", code("cmdd")}, {"shift down", code("shfd")}});
inline constexpr Dictionary kHelper = {
    kHelperClasses, {}, kHelperCommands, kHelperParameters, kHelperConstants};

inline constexpr auto kAdditionProperties =
    std::to_array<PropertyTerm>({{kVolumeSettings, "output volume", code("ouvl"), Type::Integer},
                                 {kVolumeSettings, "output muted", code("mute"), Type::Boolean}});
inline constexpr auto kAdditionCommands = std::to_array<CommandTerm>(
    {{"get volume settings", kVolumeSettings, false}, {"set volume", code("svol"), true}});
inline constexpr auto kAdditionParameters =
    std::to_array<ParameterTerm>({{code("svol"), "output volume", code("ouvl"), Type::Integer},
                                  {code("svol"), "output muted", code("mute"), Type::Boolean}});
inline constexpr Dictionary kAdditions = {
    {}, kAdditionProperties, kAdditionCommands, kAdditionParameters, {}};

}  // namespace words

/// Installed: the player "com.tarn.Player" and the helper "Keyhouse". Two documents, six albums with the ids
/// 11 to 16, the third being the current one.
class FakeWorld : public World {
 public:
  FakeWorld() {
    const auto at = [this](Code cls, std::uint64_t id, const char(&property)[5]) -> Value& {
      return player.state[{cls, id, code(property)}];
    };
    using words::kAlbum, words::kApp, words::kDoc;
    at(kApp, 0, "stat") = Constant{code("kPSP")};
    at(kApp, 0, "vol ") = std::int64_t{50};
    at(kApp, 0, "pcnt") = std::int64_t{9};
    at(kApp, 0, "froz") = false;
    at(kApp, 0, "chap") = std::int64_t{1};
    at(kApp, 0, "chas") = std::int64_t{2};
    at(kApp, 0, "time") = std::int64_t{5};
    at(kApp, 0, "scan") = Constant{code("x1  ")};
    at(kApp, 0, "srun") = true;
    at(kApp, 0, "cura") = ObjectRef{&player, kAlbum, 3};
    player.contents[{kApp, kDoc}] = {1, 2};
    player.contents[{kApp, kAlbum}] = {1, 2, 3, 4, 5, 6};
    player.contents[{kApp, code("show")}] = {7};
    player.contents[{code("show"), code("slid")}] = {70, 71};
    for (std::uint64_t id = 1; id <= 6; ++id) {
      at(kAlbum, id, "pnam") = "Album " + std::to_string(id);
      at(kAlbum, id, "ID  ") = static_cast<std::int64_t>(id + 10);
    }
    for (std::uint64_t id = 1; id <= 2; ++id) {
      at(kDoc, id, "pnam") = "Clip " + std::to_string(id);
      at(kDoc, id, "rate") = 1.0;
      at(kDoc, id, "dply") = true;
    }
    extras.replies[words::kVolumeSettings] =
        std::make_shared<const std::map<Code, Value>>(std::map<Code, Value>{
            {code("ouvl"), std::int64_t{40}}, {code("mute"), true}, {code("vol "), std::int64_t{7}}});
  }

  Application* find(std::string_view name) override {
    if (text::equalIgnoringCase(name, "com.tarn.Player")) return &player;
    return name == "Keyhouse" ? &helper : nullptr;
  }
  Application& additions() override { return extras; }

  std::vector<std::string> log;
  FakeApplication player{words::kPlayer, log};
  FakeApplication helper{words::kHelper, log};
  FakeApplication extras{words::kAdditions, log};
};

/// Compiles and runs: "result", "result | call; call", or "error LINE: message" in place of the result.
inline std::string runScript(FakeWorld& world, std::string_view source) {
  Error error;
  const auto script = Script::compile(source, world, error);
  std::string shown;
  if (script == nullptr) {
    shown = "error " + std::to_string(error.line) + ": " + error.message;
  } else if (const Outcome outcome = script->run(world); outcome.error) {
    shown = "error " + std::to_string(outcome.error->line) + ": " + outcome.error->message;
  } else {
    shown = show(outcome.value);
  }
  const char* separator = " | ";
  for (const std::string& call : world.log) shown += std::exchange(separator, "; ") + call;
  return shown;
}

inline std::string runScript(std::string_view source) {
  FakeWorld world;
  return runScript(world, source);
}

}  // namespace tarnscript
