#include "remote/deliver.h"

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <ctime>

#include "messages/kvd_messages.h"
#include "platform/base/failure.h"
#include "platform/mach.h"
#include "remote/kvd_client.h"

namespace remote {
namespace {

using Clock = std::chrono::steady_clock;

int report(kern_return_t result) {
  switch (result) {
    case KERN_SUCCESS:
      return kSent;
    case BOOTSTRAP_UNKNOWN_SERVICE:
      std::fprintf(stderr, "kvremote: %s\n", base::lastFailure().c_str());
      return kNotSent;
    case MACH_SEND_INVALID_DEST:
      std::fprintf(stderr, "kvremote: %s has ended meanwhile\n", kKVDServiceName);
      return kNotSent;
    case MACH_SEND_TIMED_OUT:
      std::fprintf(stderr, "kvremote: the queue of %s stayed full for %u seconds\n", kKVDServiceName,
                   kKVDSendTimeout / 1000);
      return kQueueStayedFull;
    default:
      std::fprintf(stderr, "kvremote: cannot send to %s (error 0x%x)\n", kKVDServiceName,
                   static_cast<unsigned>(result));
      return kNotSent;
  }
}

// The signals that would end this process; one that it was started to ignore, as under nohup, would not.
sigset_t endingSignals() {
  sigset_t signals;
  sigemptyset(&signals);
  for (const int signal : {SIGHUP, SIGINT, SIGTERM}) {
    struct sigaction current = {};
    sigaction(signal, nullptr, &current);
    if (current.sa_handler != SIG_IGN) sigaddset(&signals, signal);
  }
  return signals;
}

// Waits, and returns the signal that cut the wait short or 0.
int waitForSignal(const sigset_t& signals, std::chrono::milliseconds time) {
  const Clock::time_point end = Clock::now() + time;
  for (;;) {
    const auto left = std::max(Clock::duration::zero(), end - Clock::now());
    const auto seconds = std::chrono::floor<std::chrono::seconds>(left);
    const timespec timeout = {.tv_sec = seconds.count(),
                              .tv_nsec = std::chrono::nanoseconds(left - seconds).count()};
    const int signal = sigtimedwait(&signals, nullptr, &timeout);
    if (signal > 0) return signal;
    if (errno != EINTR) return 0;
  }
}

int sendButton(mach_port_t port, const Arguments& arguments) {
  // A button left down repeats without end: from before the press until after the release, signals wait.
  const sigset_t signals = endingSignals();
  sigset_t previous;
  const bool releases = arguments.values.size() > 1;
  if (releases) sigprocmask(SIG_BLOCK, &signals, &previous);

  kern_return_t result = KERN_SUCCESS;
  int caught = 0;
  for (std::size_t index = 0; index < arguments.values.size() && result == KERN_SUCCESS; ++index) {
    if (index > 0) caught = waitForSignal(signals, arguments.hold);
    result = kvd_handlehidevent(port, arguments.usagePage, arguments.usage, arguments.extra,
                                arguments.values[index]);
  }
  const int status = report(result);

  // Dying of the signal, not exiting with its number, is what lets a shell's loop end with it.
  if (releases) sigprocmask(SIG_SETMASK, &previous, nullptr);
  if (caught != 0) raise(caught);
  return status;
}

}  // namespace

int deliver(const Arguments& arguments) {
  mach_port_t port = MACH_PORT_NULL;
  const kern_return_t found = kvd_look_up(&port);
  if (found != KERN_SUCCESS) return report(found);
  switch (arguments.action) {
    case Action::SendButton:
      return sendButton(port, arguments);
    case Action::SetScreenLocked:
      return report(kvd_setscreenlocked(port, arguments.locked ? 1 : 0));
    case Action::Terminate:
      return report(kvd_terminate(port));
    default:
      return report(KERN_INVALID_ARGUMENT);
  }
}

}  // namespace remote
