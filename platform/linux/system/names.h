// The names on the session bus, and the processes behind them.
//
// One question lists the names, signals tell of every change after that.
#pragma once

#include <sys/types.h>

#include <optional>
#include <string>
#include <string_view>

namespace linux::system {

/// Somebody who wants to know who owns which names. Empty owners are nobody; a unique name owns itself.
struct NameFollower {
  bool (*wants)(std::string_view name);
  void (*take)(const std::string& name, const std::string& before, const std::string& after);
};

/// Tells the follower, who is borrowed for good, of all changes of names that he wants from here on. Ends
/// with our connection to the bus.
void followNames(const NameFollower& follower);

/// Tells the follower of the names that he wants and that are there, those of older connections first. False
/// where the bus did not tell all of them in time: to be called again then, which tells of some twice.
bool tellNames(const NameFollower& follower);

/// The process behind a unique name; 0 where the bus does not know. Nothing while it has not answered: it is
/// asked once.
std::optional<pid_t> processOf(const std::string& uniqueName);

}  // namespace linux::system
