// The keystroke helper: an application in the background that presses keys for scripts.
#pragma once

#include "platform/stage/application.h"

namespace stage {

class Keyhouse final : public Application {
 public:
  Keyhouse() : Application(scripting::kKeyhouse, "1.3") {}

  const tarnscript::Dictionary& dictionary() const override;
  /// Belongs to the desktop and needs no start.
  bool running() const override { return true; }

 protected:
  /// A process by the bundle identifier of its application.
  tarnscript::ObjectRef find(const tarnscript::ObjectRef& object, tarnscript::Code cls,
                             const tarnscript::Value& id) override;
  tarnscript::Value obey(const tarnscript::Event& event) override;
};

}  // namespace stage
