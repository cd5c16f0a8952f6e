// A model application: what it is called, which of its instances run, and what scripts, events, keys and time
// do to it.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "platform/host.h"
#include "platform/scripting/identity.h"
#include "platform/stage/clock.h"
#include "platform/tarnscript/tarnscript.h"

namespace stage {

/// How an application treats scripts.
enum class Manner {
  Obeys,    ///< does as it is told
  Refuses,  ///< answers everything with an error
  Ignores,  ///< does nothing and answers nothing
};

/// An application of the rehearsal desktop; by itself one that can be started, brought to the front and quit,
/// and understands no words of its own.
class Application : public tarnscript::Application {
 public:
  Application(std::string bundleIdentifier, std::string displayName, std::string bundleVersion);
  Application(const scripting::Identity& identity, std::string bundleVersion);
  Application(const Application&) = delete;
  Application& operator=(const Application&) = delete;

  const std::string identifier;
  const std::string name;
  /// Empty when it has none.
  std::string version;

  /// Its running instances, oldest first.
  std::vector<HostProcessSerialNumber> instances;
  Manner manner = Manner::Obeys;
  /// Until then it answers nobody.
  Nanoseconds hangsUntil = 0;

  const tarnscript::Dictionary& dictionary() const override;
  bool running() const override { return !instances.empty(); }
  void launch() final;
  void activate() final;
  /// A hung application makes a script that waits for replies wait.
  void deliver(bool waitsForReply) final;
  tarnscript::Value get(const tarnscript::ObjectRef& object, tarnscript::Code property) final;
  void set(const tarnscript::ObjectRef& object, tarnscript::Code property,
           const tarnscript::Value& value) final;
  std::vector<tarnscript::ObjectRef> elements(const tarnscript::ObjectRef& object,
                                              tarnscript::Code cls) final;
  tarnscript::ObjectRef elementWithID(const tarnscript::ObjectRef& object, tarnscript::Code cls,
                                      const tarnscript::Value& id) final;
  tarnscript::Value perform(const tarnscript::Event& event) final;

  /// An inter-application event arrived.
  virtual void receiveEvent(std::uint32_t eventClass, std::uint32_t eventID);
  /// A key was pressed in it, with Shift held or not.
  virtual void receiveKey(std::uint16_t virtualKey, bool withShift);
  /// Its first instance started, its last one ended.
  virtual void started() {}
  virtual void ended() {}
  /// When it next changes by itself, if ever.
  virtual std::optional<Nanoseconds> nextChange() const { return std::nullopt; }
  /// Brings it to the present.
  virtual void advance() {}
  /// Its state in a few words, for people; empty when there is nothing to say.
  virtual std::string describe() const { return {}; }
  /// What changes too often for that, and its settings: a position, a volume; empty when there is nothing.
  virtual std::string details() const { return {}; }

 protected:
  // What a model answers to scripts. The defaults refuse.
  virtual tarnscript::Value read(const tarnscript::ObjectRef& object, tarnscript::Code property);
  virtual void write(const tarnscript::ObjectRef& object, tarnscript::Code property,
                     const tarnscript::Value& value);
  virtual std::vector<tarnscript::ObjectRef> list(const tarnscript::ObjectRef& object, tarnscript::Code cls);
  virtual tarnscript::ObjectRef find(const tarnscript::ObjectRef& object, tarnscript::Code cls,
                                     const tarnscript::Value& id);
  virtual tarnscript::Value obey(const tarnscript::Event& event);

  /// Writes into the journal that something changed in it.
  void changed(const std::string& what) const;
};

}  // namespace stage
