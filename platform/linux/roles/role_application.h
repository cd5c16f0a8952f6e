// What the applications that scripts name have in common here: each is a role, played by whichever program
// stands first for it when an event arrives.
#pragma once

#include <vector>

#include "platform/linux/roles/performer.h"
#include "platform/tarnscript/tarnscript.h"

namespace linux::roles {

class RoleApplication : public tarnscript::Application {
 public:
  explicit RoleApplication(programs::Role role) : role_(role) {}

  bool running() const final;
  /// Starts the role's default program and does not wait for it; nothing while one is starting.
  void launch() final;
  /// As launch, and brings a running program to the front. Never fails: scripts do their real work after it.
  void activate() final;
  void deliver(bool waitsForReply) final;

  // Settle who performs and hand it down to the functions below; refuse when nobody plays the role.
  tarnscript::Value get(const tarnscript::ObjectRef& object, tarnscript::Code property) final;
  void set(const tarnscript::ObjectRef& object, tarnscript::Code property,
           const tarnscript::Value& value) final;
  std::vector<tarnscript::ObjectRef> elements(const tarnscript::ObjectRef& object,
                                              tarnscript::Code cls) final;
  tarnscript::ObjectRef elementWithID(const tarnscript::ObjectRef& object, tarnscript::Code cls,
                                      const tarnscript::Value& id) final;
  tarnscript::Value perform(const tarnscript::Event& event) final;

 protected:
  // The defaults refuse; commands go to the program's actions.
  virtual tarnscript::Value getBy(const Performer& performer, const tarnscript::ObjectRef& object,
                                  tarnscript::Code property);
  virtual void setBy(const Performer& performer, const tarnscript::ObjectRef& object,
                     tarnscript::Code property, const tarnscript::Value& value);
  virtual std::vector<tarnscript::ObjectRef> elementsBy(const Performer& performer,
                                                        const tarnscript::ObjectRef& object,
                                                        tarnscript::Code cls);
  virtual tarnscript::Value performBy(const Performer& performer, const tarnscript::Event& event);

 private:
  Performer performer() const;

  const programs::Role role_;
};

}  // namespace linux::roles
