// The daemon's service port, kept open.
#pragma once

#include <cstdint>
#include <deque>
#include <functional>
#include <optional>

#include "platform/mach.h"
#include "receiver/clock.h"
#include "receiver/handles.h"
#include "remote/buttons.h"

namespace receiver {

class Port {
 public:
  /// Looks for the port, and again whenever its socket comes or goes; `changed` is called when somebody
  /// listens anew and when nobody does any more, not for what is found at once.
  Port(sd_event* loop, std::function<void()> changed);
  Port(const Port&) = delete;
  Port& operator=(const Port&) = delete;

  /// Whether somebody listens. A service manager counts that would start the daemon.
  bool isOpen() const { return port_ != MACH_PORT_NULL; }

  /// Sends a button. Where nobody listens it goes out when somebody does, if that is soon: a daemon may be on
  /// its way.
  void sendButton(const remote::Button& button, std::int32_t value);

  /// Says that the screen is locked or unlocked, and says it again to whoever listens anew.
  void setLocked(bool locked);

  /// The daemon has ended or has been started anew, and knows nothing of the lock. It is said again at once,
  /// or before the next button where nobody is to be started for it.
  void daemonStarted();
  void daemonEnded() { lockTold_ = false; }

 private:
  struct Waiting {
    const remote::Button* button;
    std::int32_t value;
    Time since;
  };

  void lookUp();
  void lookAgain();
  void lose();
  bool send(const remote::Button& button, std::int32_t value);
  void tellLock();
  void sendWaiting();

  std::function<void()> changed_;
  mach_port_t port_ = MACH_PORT_NULL;
  std::optional<bool> locked_;
  bool lockTold_ = false;
  std::deque<Waiting> waiting_;
  Source watch_;
};

}  // namespace receiver
