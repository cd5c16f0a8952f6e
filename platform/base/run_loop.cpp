#include "platform/base/run_loop.h"

#include "platform/base/clock.h"
#include "platform/base/sources.h"
#include "platform/base/timers.h"

namespace base {
namespace {

struct RunLoop final : HostObject {
  static constexpr Kind kKind = Kind::RunLoop;
  RunLoop() : HostObject(kKind) { immortal = true; }
  bool running = false;
  bool stopped = false;
  std::uint64_t passes = 0;
};

RunLoop& theLoop() {
  static auto& loop = *new RunLoop;
  return loop;
}

/// True when a timer fired.
bool fireDueTimers(const RunLoop& loop) {
  bool fired = false;
  for (const auto& timer : dueTimers(timeSource().now())) {
    if (loop.stopped) break;
    if (!timer->onLoop) continue;
    fire(*timer);
    fired = true;
  }
  return fired;
}

/// True when there was something to do.
bool runPass(RunLoop& loop) {
  ++loop.passes;
  const bool fired = fireDueTimers(loop);
  const auto source = retained(nextReadySource());
  if (source == nullptr || loop.stopped) return fired;
  source->ready();
  return true;
}

void run(RunLoop& loop) {
  if (loop.running) return;
  loop.running = true;
  loop.stopped = false;
  while (!loop.stopped) {
    if (!runPass(loop)) timeSource().wait(earliestDue());
  }
  loop.running = false;
}

}  // namespace

std::uint64_t turn() { return theLoop().passes; }

void runPending() {
  constexpr int kMostPasses = 64;
  RunLoop& loop = theLoop();
  if (loop.running) return;
  loop.running = true;
  loop.stopped = false;
  for (int i = 0; i < kMostPasses && !loop.stopped && runPass(loop); ++i) continue;
  loop.running = false;
}

}  // namespace base

HostRunLoopRef HostRunLoopCurrent() { return HostRunLoopRef(&base::theLoop()); }

void HostRunLoopRun() { base::run(base::theLoop()); }

void HostRunLoopStop(HostRunLoopRef loop) {
  if (auto* stopped = base::as<base::RunLoop>(loop)) stopped->stopped = true;
}
