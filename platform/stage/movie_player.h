// The two model movie players. They differ in their words and in the scale of their volume.
#pragma once

#include <string>
#include <vector>

#include "platform/stage/application.h"
#include "platform/stage/playhead.h"

namespace stage {

class MoviePlayer final : public Application {
 public:
  /// The volume runs from 0 to `loudest`; in the classic player's words it is a whole number.
  MoviePlayer(const scripting::Identity& identity, std::string bundleVersion,
              const tarnscript::Dictionary& words, double loudest);

  const tarnscript::Dictionary& dictionary() const override { return words_; }
  /// Opens its movies, all standing at the beginning.
  void started() override;
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
  tarnscript::Value obey(const tarnscript::Event& event) override;

 private:
  struct Movie {
    std::uint64_t id;
    std::string title;
    Nanoseconds length;
    double volume;
    Playhead playhead;
  };

  Movie& movieOf(const tarnscript::ObjectRef& object);
  static std::string describe(const Movie& movie);
  void setRate(Movie& movie, double rate, Nanoseconds when = now());
  void step(Movie& movie, int frames);

  const tarnscript::Dictionary& words_;
  const double loudest_;
  /// Front first.
  std::vector<Movie> movies_;
  bool fullScreen_ = false;
};

}  // namespace stage
