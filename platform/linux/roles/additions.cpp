#include "platform/linux/roles/additions.h"

#include <algorithm>

#include "platform/linux/sound/sound.h"
#include "platform/scripting/additions_dictionary.h"

namespace linux::roles {

namespace {

namespace words = scripting::additions;
using tarnscript::Code;
using tarnscript::ObjectRef;
using tarnscript::Value;

/// In the words of scripts, for which what is amplified is at its top.
constexpr int kFullVolume = 100;

[[noreturn]] void refuse() { throw tarnscript::Refusal{"this is no command of the desktop"}; }

void require(bool done) {
  if (!done) throw tarnscript::Refusal{"the sound server does not answer"};
}

/// It always runs, and has commands and nothing else.
class Additions final : public tarnscript::Application {
 public:
  const tarnscript::Dictionary& dictionary() const override { return words::dictionary(); }
  bool running() const override { return true; }
  void launch() override {}
  void activate() override {}
  void deliver(bool) override {}
  Value get(const ObjectRef&, Code) override { refuse(); }
  void set(const ObjectRef&, Code, const Value&) override { refuse(); }
  std::vector<ObjectRef> elements(const ObjectRef&, Code) override { refuse(); }
  ObjectRef elementWithID(const ObjectRef&, Code, const Value&) override { refuse(); }
  Value perform(const tarnscript::Event& event) override;
};

Value volumeSettings() {
  const auto state = sound::soundState();
  require(state.has_value());
  return words::volumeSettings(std::min(state->volume, kFullVolume), state->muted);
}

void setVolume(const words::VolumeChange& change) {
  if (change.volume) require(sound::setOutputVolume(std::clamp(*change.volume, 0, kFullVolume)));
  if (change.muted) require(sound::setOutputMuted(*change.muted));
}

Value Additions::perform(const tarnscript::Event& event) {
  if (event.command == words::kGetVolumeSettings) return volumeSettings();
  if (event.command != words::kSetVolume) refuse();
  setVolume(words::volumeChange(event));
  return {};
}

}  // namespace

tarnscript::Application& additions() {
  static Additions instance;
  return instance;
}

}  // namespace linux::roles
