#include "receiver/holds.h"

#include <algorithm>

namespace receiver {

void Holds::say(const Hold& hold, std::int32_t value) const {
  const auto values = remote::tapValues(*hold.button);
  if (std::ranges::find(values, value) != values.end()) say_(*hold.button, value);
}

template <typename Condition>
void Holds::releaseWhere(Condition condition) {
  for (auto it = holds_.begin(); it != holds_.end();) {
    if (!condition(it->first, it->second)) {
      ++it;
      continue;
    }
    const Hold hold = it->second;
    it = holds_.erase(it);
    say(hold, remote::kReleased);
  }
}

void Holds::press(Key key, const remote::Button& button, Time now, bool bounces) {
  // A release that waited until now comes first.
  advance(now);
  const auto found = holds_.find(key);
  if (found != holds_.end() && bounces && now < found->second.pressed + kBounce) {
    found->second.releaseWaits = false;
    return;
  }
  // Of a press that is down already the release was lost on the way.
  releaseWhere([key](const Key& held, const Hold&) { return held == key; });
  const Hold hold{&button, now, bounces, false};
  holds_.emplace(key, hold);
  say(hold, remote::kPressed);
}

void Holds::release(Key key, Time now) {
  const auto found = holds_.find(key);
  if (found == holds_.end()) return;
  if (found->second.bounces && now < found->second.pressed + kBounce) {
    found->second.releaseWaits = true;
    return;
  }
  const Hold hold = found->second;
  holds_.erase(found);
  say(hold, remote::kReleased);
}

std::optional<Time> Holds::due() const {
  std::optional<Time> earliest;
  for (const auto& [key, hold] : holds_) {
    const Time due = hold.pressed + kBounce;
    if (hold.releaseWaits && (!earliest || due < *earliest)) earliest = due;
  }
  return earliest;
}

void Holds::advance(Time now) {
  releaseWhere(
      [now](const Key&, const Hold& hold) { return hold.releaseWaits && hold.pressed + kBounce <= now; });
}

void Holds::releaseDevice(int device) {
  releaseWhere([device](const Key& key, const Hold&) { return key.device == device; });
}

void Holds::releaseAll() {
  releaseWhere([](const Key&, const Hold&) { return true; });
}

}  // namespace receiver
