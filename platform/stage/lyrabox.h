// The model music jukebox: a short list of tracks that play in time.
#pragma once

#include <string>

#include "platform/stage/application.h"

namespace stage {

class Lyrabox final : public Application {
 public:
  Lyrabox();

  const tarnscript::Dictionary& dictionary() const override;
  tarnscript::Value get(const tarnscript::ObjectRef& object, tarnscript::Code property) override;
  void set(const tarnscript::ObjectRef& object, tarnscript::Code property,
           const tarnscript::Value& value) override;
  std::vector<tarnscript::ObjectRef> elements(const tarnscript::ObjectRef& object,
                                              tarnscript::Code cls) override;
  tarnscript::ObjectRef elementWithID(const tarnscript::ObjectRef& object, tarnscript::Code cls,
                                      const tarnscript::Value& id) override;
  tarnscript::Value perform(const tarnscript::Event& event) override;
  /// Its remote interface's select: plays the current track from the start.
  void receiveEvent(std::uint32_t eventClass, std::uint32_t eventID) override;
  void ended() override;
  std::optional<Nanoseconds> nextChange() const override;
  void advance() override;
  std::string describe() const override;

 private:
  enum class State { Stopped, Playing, Paused, FastForwarding, Rewinding };

  tarnscript::ObjectRef track(std::size_t index);
  /// Seconds of the track that pass in a second.
  int speed() const;
  bool scanning() const { return state_ == State::FastForwarding || state_ == State::Rewinding; }
  Nanoseconds duration() const;
  void enter(State state);
  void scan(State direction);
  void goTo(std::size_t index, Nanoseconds position);
  void nextTrack();
  void backTrack();
  void stop();

  State state_ = State::Stopped;
  /// What a scan goes back to.
  State beforeScan_ = State::Playing;
  std::size_t current_ = 0;
  /// Where in the track it was at `since_`.
  Nanoseconds position_ = 0;
  Nanoseconds since_ = 0;
  int volume_ = 60;  ///< 0 to 100
};

}  // namespace stage
