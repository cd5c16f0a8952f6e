// What the applications that scripts name have in common here: each is a role, played by whichever program
// stands first for it when a word arrives.
#pragma once

#include <vector>

#include "platform/linux/programs/running.h"
#include "platform/tarnscript/tarnscript.h"

namespace desktop {

class RoleApplication : public tarnscript::Application {
 public:
  explicit RoleApplication(Role role) : role_(role) {}

  bool running() const final;
  /// Starts the role's default program and does not wait for it; nothing while one is starting.
  void launch() final;
  /// As launch, and brings a running program to the front. Never fails: scripts do their real work after it.
  void activate() final;
  void deliver(bool waitsForReply) final;

  // The defaults refuse; commands go to their row of deeds().
  tarnscript::Value get(const tarnscript::ObjectRef& object, tarnscript::Code property) override;
  void set(const tarnscript::ObjectRef& object, tarnscript::Code property,
           const tarnscript::Value& value) override;
  std::vector<tarnscript::ObjectRef> elements(const tarnscript::ObjectRef& object,
                                              tarnscript::Code cls) override;
  tarnscript::ObjectRef elementWithID(const tarnscript::ObjectRef& object, tarnscript::Code cls,
                                      const tarnscript::Value& id) override;
  tarnscript::Value perform(const tarnscript::Event& event) override;

 protected:
  /// The program that plays the role now; throws tarnscript::Refusal when none does.
  const Instance& instance() const;
  /// Its player on the bus; throws tarnscript::Refusal when it has none.
  Player& player() const;

 private:
  const Role role_;
};

// One for each role that scripts speak to, each in its own file; and the keystroke helper.
tarnscript::Application& jukebox();
tarnscript::Application& discPlayer();
tarnscript::Application& classicMovies();
tarnscript::Application& modernMovies();
tarnscript::Application& presentation();
tarnscript::Application& photoLibrary();
tarnscript::Application& keyhouse();

}  // namespace desktop
