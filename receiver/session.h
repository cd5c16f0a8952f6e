// What the login manager (systemd-logind) says of the user's session.
//
// A service of the user's manager is in no session itself: the one to look at is what logind calls the user's
// Display.
#pragma once

#include <functional>
#include <string>

#include "receiver/handles.h"

namespace receiver {

class Session {
 public:
  struct Listener {
    /// The session is the active one of its seat, or is not; said at every change, and first when logind has
    /// answered.
    std::function<void(bool)> active;
    /// The session is locked, or was asked to lock; or the opposite.
    std::function<void(bool)> locked;
    /// The machine is about to sleep.
    std::function<void()> sleeps;
  };

  /// Asks over the system bus, which may be null, and follows what changes for as long as it lives. Where
  /// there is no logind, the session counts as active. The loop ends with status 1 where a bus on which
  /// logind has answered is lost.
  Session(sd_bus* system, Listener listener);
  Session(const Session&) = delete;
  Session& operator=(const Session&) = delete;

 private:
  int takeOwner(sd_bus_message* signal);
  int askForUser(sd_bus_message* cause);
  int takeUser(sd_bus_message* answer);
  int askForDisplay(sd_bus_message* cause);
  int takeDisplay(sd_bus_message* answer);
  int askForState(sd_bus_message* cause);
  int takeState(sd_bus_message* answer);
  int takeLock(sd_bus_message* signal);
  int takeUnlock(sd_bus_message* signal);
  int takeSleep(sd_bus_message* signal);

  sd_bus* bus_;
  Listener listener_;
  std::string user_;
  std::string session_;
  /// What LockedHint was.
  bool hint_ = false;
  Slot ownerMatch_, loginMatch_, sleepMatch_, userMatch_, stateMatch_, lockMatch_, unlockMatch_;
  Slot userCall_, displayCall_, stateCall_;
};

}  // namespace receiver
