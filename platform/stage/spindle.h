// The model disc player: a film in chapters, and a disc menu in front of it.
#pragma once

#include <string>

#include "platform/stage/application.h"
#include "platform/stage/playhead.h"

namespace stage {

class Spindle final : public Application {
 public:
  Spindle();

  const tarnscript::Dictionary& dictionary() const override;
  void ended() override;
  std::optional<Nanoseconds> nextChange() const override;
  void advance() override;
  std::string describe() const override;
  std::string details() const override;

  /// Puts a disc in, stopped at its beginning, or takes it out.
  void setDisc(bool present);

 protected:
  tarnscript::Value read(const tarnscript::ObjectRef& object, tarnscript::Code property) override;
  void write(const tarnscript::ObjectRef& object, tarnscript::Code property,
             const tarnscript::Value& value) override;
  tarnscript::Value obey(const tarnscript::Event& event) override;

 private:
  /// The film stands still behind the menu.
  enum class State { Stopped, Playing, Paused, Menu };

  int chapter() const;
  void enter(State state, double rate, Nanoseconds when = now());
  void seek(Nanoseconds position, Nanoseconds when = now());
  void stepInMenu(int step);
  void chooseFromMenu();

  bool hasDisc_ = true;
  State state_ = State::Stopped;
  Playhead playhead_;
  int menuItem_ = 0;
  tarnscript::Code scanRate_;
  int volume_ = 192;  ///< 0 to 255
  bool muted_ = false;
  bool subtitles_ = false;
  bool controllerVisible_ = true;
  bool fullScreen_ = false;
};

}  // namespace stage
