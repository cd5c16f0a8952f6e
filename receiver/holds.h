// What is down on the remotes, and what that makes to say.
//
// A button that people hold says that it went down and that it came up; every other one that it went down and
// no more, for applications act on every message of theirs. What goes in are a remote's keys with the times
// at which they changed; nothing here reads a clock.
#pragma once

#include <chrono>
#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <utility>

#include "receiver/clock.h"
#include "remote/buttons.h"

namespace receiver {

/// Contacts of rubber keys settle within 20 ms, and nobody presses one key twice within 60: what comes sooner
/// than this after a press belongs to it.
inline constexpr Time kBounce = std::chrono::milliseconds(40);

/// One key of one device. What names the device is the caller's choice.
struct Key {
  int device = 0;
  std::uint16_t code = 0;
  auto operator<=>(const Key&) const = default;
};

/// Takes a message for the daemon: the button, and 1 (down) or 0 (up).
using Say = std::function<void(const remote::Button&, std::int32_t value)>;

class Holds {
 public:
  explicit Holds(Say say) : say_(std::move(say)) {}

  /// A key went down. Where contacts bounce, a second press within kBounce of the first is none.
  void press(Key key, const remote::Button& button, Time now, bool bounces);

  /// A key came up; nothing where its press was not told. Within kBounce of a press that bounces, the release
  /// waits until that is over.
  void release(Key key, Time now);

  /// When the next waiting release is due.
  std::optional<Time> due() const;

  /// Says the releases that are due at this time.
  void advance(Time now);

  /// Makes up the releases of a device that is gone, or of all.
  void releaseDevice(int device);
  void releaseAll();

 private:
  struct Hold {
    const remote::Button* button;
    Time pressed;
    bool bounces;
    bool releaseWaits;
  };

  void say(const Hold& hold, std::int32_t value) const;
  template <typename Condition>
  void releaseWhere(Condition condition);

  Say say_;
  std::map<Key, Hold> holds_;
};

}  // namespace receiver
