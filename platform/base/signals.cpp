#include <sys/signalfd.h>
#include <unistd.h>

#include <csignal>
#include <cstdint>
#include <limits>

#include "platform/base/run_loop.h"
#include "platform/base/signal_set.h"

namespace base {
namespace {

bool sEnded = false;

/// Ends the run and takes all that is pending: two signals end one run.
void endRun(int signals) {
  signalfd_siginfo info{};
  while (read(signals, &info, sizeof info) > 0) {
  }
  sEnded = true;
  HostRunLoopStop(HostRunLoopCurrent());
}

}  // namespace

void endLoopOnSignals() {
  static bool installed = false;
  if (installed) return;
  std::signal(SIGPIPE, SIG_IGN);
  const sigset_t ending = signalSet({SIGTERM, SIGINT});
  const int signals = signalfd(-1, &ending, SFD_CLOEXEC | SFD_NONBLOCK);
  // Without the descriptor the signals keep their default action, which ends the process too.
  if (signals < 0) return;
  sigprocmask(SIG_BLOCK, &ending, nullptr);
  auto* source =
      new Source(signals, std::numeric_limits<std::int32_t>::min(), [signals] { endRun(signals); });
  source->immortal = true;
  HostRunLoopAddSource(HostRunLoopCurrent(), HostSourceRef(source), HostRunLoopMode::Default);
  installed = true;
}

bool endedBySignal() { return sEnded; }

}  // namespace base
