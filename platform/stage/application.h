// A model application: what it is called, which of its instances run, and what scripts, events and time do to
// it.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "platform/host.h"
#include "platform/stage/clock.h"
#include "platform/tarnscript/tarnscript.h"

namespace stage {

/// An application of the rehearsal desktop; by itself one that can be started, brought to the front and quit,
/// and understands no words of its own.
class Application : public tarnscript::Application {
 public:
  Application(std::string bundleIdentifier, std::string displayName, std::string bundleVersion);
  Application(const Application&) = delete;
  Application& operator=(const Application&) = delete;

  const std::string identifier;
  const std::string name;
  const std::string version;

  /// Its running instances, oldest first.
  std::vector<HostProcessSerialNumber> instances;
  /// Until then it answers nobody.
  Nanoseconds hangsUntil = 0;

  const tarnscript::Dictionary& dictionary() const override;
  bool running() const override { return !instances.empty(); }
  void launch() override;
  void activate() override;
  /// A hung application makes a script that waits for replies wait.
  void deliver(bool waitsForReply) override;
  tarnscript::Value get(const tarnscript::ObjectRef& object, tarnscript::Code property) override;
  void set(const tarnscript::ObjectRef& object, tarnscript::Code property,
           const tarnscript::Value& value) override;
  std::vector<tarnscript::ObjectRef> elements(const tarnscript::ObjectRef& object,
                                              tarnscript::Code cls) override;
  tarnscript::ObjectRef elementWithID(const tarnscript::ObjectRef& object, tarnscript::Code cls,
                                      const tarnscript::Value& id) override;
  tarnscript::Value perform(const tarnscript::Event& event) override;

  /// An inter-application event arrived.
  virtual void receiveEvent(std::uint32_t eventClass, std::uint32_t eventID);
  /// Its first instance started, its last one ended.
  virtual void started() {}
  virtual void ended() {}
  /// When it next changes by itself, if ever.
  virtual std::optional<Nanoseconds> nextChange() const { return std::nullopt; }
  /// Brings it to the present.
  virtual void advance() {}
  /// Its state in a few words, for people; empty when there is nothing to say.
  virtual std::string describe() const { return {}; }

 protected:
  /// Writes into the journal that something changed in it.
  void changed(const std::string& what) const;
};

}  // namespace stage
