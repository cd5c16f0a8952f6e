#include "platform/stage/playhead.h"

#include <algorithm>
#include <cmath>

namespace stage {

Nanoseconds Playhead::positionAt(Nanoseconds time) const {
  const auto moved = static_cast<Nanoseconds>(std::llround(rate_ * static_cast<double>(time - since_)));
  return std::max<Nanoseconds>(position_ + moved, 0);
}

Nanoseconds Playhead::position() const { return positionAt(now()); }

void Playhead::setRate(double rate, Nanoseconds when) {
  seek(positionAt(when), when);
  rate_ = rate;
}

void Playhead::seek(Nanoseconds position, Nanoseconds when) {
  position_ = position;
  since_ = when;
}

std::optional<Nanoseconds> Playhead::arrival(Nanoseconds length) const {
  if (rate_ == 0) return std::nullopt;
  const Nanoseconds left = std::max<Nanoseconds>(rate_ > 0 ? length - position_ : position_, 0);
  return since_ + static_cast<Nanoseconds>(std::ceil(static_cast<double>(left) / std::abs(rate_)));
}

double inSeconds(Nanoseconds position) {
  return static_cast<double>(position) / static_cast<double>(kSecond);
}

}  // namespace stage
