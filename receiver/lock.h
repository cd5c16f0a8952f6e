// Whether the screen is locked, by all who can tell.
#pragma once

#include <array>
#include <functional>

#include "receiver/handles.h"

namespace receiver {

class Lock {
 public:
  /// Calls `changed` with the new state at every change. `session` is the session bus, on which desktops have
  /// their screen savers; it may be null.
  Lock(sd_bus* session, std::function<void(bool)> changed);
  Lock(const Lock&) = delete;
  Lock& operator=(const Lock&) = delete;

  /// What the login manager said last.
  void setSessionLocked(bool locked);

  bool locked() const;

 private:
  /// A screen saver, of which a desktop has one or none, under one name or both.
  struct Saver {
    Lock* lock = nullptr;
    bool active = false;
    Slot match, call;
    int take(sd_bus_message* message);
  };

  void set(bool& member, bool value);

  std::function<void(bool)> changed_;
  bool session_ = false;
  std::array<Saver, 2> savers_;
};

}  // namespace receiver
