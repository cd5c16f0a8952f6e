// The model presentation application: slides that take the display, a slide switcher over them, freeze.
#pragma once

#include <string>
#include <vector>

#include "platform/stage/application.h"

namespace stage {

class Slidewell final : public Application {
 public:
  Slidewell();

  const tarnscript::Dictionary& dictionary() const override;
  void ended() override;
  std::string describe() const override;

 protected:
  tarnscript::Value read(const tarnscript::ObjectRef& object, tarnscript::Code property) override;
  void write(const tarnscript::ObjectRef& object, tarnscript::Code property,
             const tarnscript::Value& value) override;
  std::vector<tarnscript::ObjectRef> list(const tarnscript::ObjectRef& object, tarnscript::Code cls) override;
  tarnscript::Value obey(const tarnscript::Event& event) override;

 private:
  void start();
  void stop();
  void goTo(int slide);
  void moveSwitcher(int step);
  void closeSwitcher(bool accept);

  bool playing_ = false;
  bool frozen_ = false;
  int slide_ = 1;
  /// The slide that the switcher is at; 0 while it is hidden.
  int switcher_ = 0;
};

}  // namespace stage
