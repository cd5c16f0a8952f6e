// Whether the program in front takes the remote itself.
#pragma once

#include <functional>
#include <optional>
#include <string>

#include "receiver/clock.h"
#include "receiver/handles.h"

namespace receiver {

/// The program in front, by its name, where it takes the remote itself; empty where it does not.
std::string takerNow();

/// The same as it changes.
class Front {
 public:
  /// Calls `changed` when the remote is another program's, or nobody's any more; follows nobody at first.
  Front(sd_event* loop, std::function<void()> changed);
  ~Front();
  Front(const Front&) = delete;
  Front& operator=(const Front&) = delete;

  /// Follows who is in front, or no longer: while no remote is read nobody needs to know.
  void follow(bool on);

  /// The program that has the remote, by its name; empty when none has.
  const std::string& taker() const { return taker_; }

  /// To be called before a key is taken: looks again where nothing tells of changes.
  void refresh();

 private:
  void takeIn();

  std::function<void()> changed_;
  bool following_ = false;
  std::string taker_;
  /// When it was looked last.
  std::optional<Time> looked_;
  Source source_;
};

}  // namespace receiver
