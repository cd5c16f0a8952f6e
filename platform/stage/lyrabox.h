// The model music jukebox: a short list of tracks that play in time.
#pragma once

#include <string>

#include "platform/stage/application.h"
#include "platform/stage/playhead.h"

namespace stage {

class Lyrabox final : public Application {
 public:
  Lyrabox();

  const tarnscript::Dictionary& dictionary() const override;
  /// Its remote interface's select: plays the current track from the start.
  void receiveEvent(std::uint32_t eventClass, std::uint32_t eventID) override;
  void ended() override;
  std::optional<Nanoseconds> nextChange() const override;
  void advance() override;
  std::string describe() const override;
  std::string details() const override;

 protected:
  tarnscript::Value read(const tarnscript::ObjectRef& object, tarnscript::Code property) override;
  void write(const tarnscript::ObjectRef& object, tarnscript::Code property,
             const tarnscript::Value& value) override;
  std::vector<tarnscript::ObjectRef> list(const tarnscript::ObjectRef& object, tarnscript::Code cls) override;
  tarnscript::ObjectRef find(const tarnscript::ObjectRef& object, tarnscript::Code cls,
                             const tarnscript::Value& id) override;
  tarnscript::Value obey(const tarnscript::Event& event) override;

 private:
  enum class State { Stopped, Playing, Paused, FastForwarding, Rewinding };

  static double rateOf(State state);
  tarnscript::ObjectRef track(std::size_t index);
  bool scanning() const { return state_ == State::FastForwarding || state_ == State::Rewinding; }
  Nanoseconds duration() const;
  void enter(State state, Nanoseconds when = now());
  void scan(State direction);
  void goTo(std::size_t index, Nanoseconds when = now());
  void nextTrack(Nanoseconds when = now());
  void backTrack();
  void stop();

  State state_ = State::Stopped;
  /// What a scan goes back to.
  State beforeScan_ = State::Playing;
  std::size_t current_ = 0;
  Playhead playhead_;
  int volume_ = 60;  ///< 0 to 100
};

}  // namespace stage
