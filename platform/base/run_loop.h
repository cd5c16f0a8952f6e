// The run loop: one thread, one mode, timers and sources.
//
// A pass fires each timer that is due once, in due order, and then serves one ready source, so that neither a
// timer that is always overdue nor a port that is always full can starve the other. When a pass found nothing
// to do the loop waits. What time it is, how to wait and how to sleep can be replaced: that is how a
// rehearsal runs two hours in no time.
//
// The loop keeps one reference to each timer and source that is on it. A stop ends the run in progress;
// without one it does nothing.
#pragma once

#include <cstdint>
#include <functional>
#include <optional>

#include "platform/base/object.h"

namespace base {

/// Nanoseconds on the clock of HostAbsoluteTime.
using Nanoseconds = std::int64_t;
inline constexpr Nanoseconds kSecond = 1'000'000'000;

/// The loop's idea of time; the default, for each member that is empty too, is CLOCK_BOOTTIME.
struct TimeSource {
  /// Never goes back and stays below 73 years.
  std::function<Nanoseconds()> now;
  /// Called when nothing is ready and nothing is due; returns when that may have changed. `deadline` is when
  /// the next timer is due, if there is one.
  std::function<void(std::optional<Nanoseconds> deadline)> wait;
  std::function<void(Nanoseconds duration)> sleep;
};
void setTimeSource(TimeSource source);

/// The default wait: blocks until a source is ready or the deadline, on CLOCK_BOOTTIME, has come.
void waitForSources(std::optional<Nanoseconds> deadline);

/// A descriptor that polls as readable while a source on the loop has data waiting in the kernel.
int runLoopDescriptor();

/// Serves what is ready and due by now, of a flood a part, and does not wait: for a program with another loop
/// of its own, which watches runLoopDescriptor(). Nothing while the loop runs.
void runPending();

/// Something that becomes readable. The descriptor stays with whoever made the source, must be one that epoll
/// takes and can stand behind one source on the loop at a time; otherwise the source does not go on.
struct Source : HostObject {
  static constexpr Kind kKind = Kind::Source;
  Source(int descriptor, std::int32_t rank, std::function<void()> callback);

  const int fd;
  const std::int32_t order;
  const std::function<void()> ready;
  /// Where set: asked before each poll, true when the source has something to deliver whatever the descriptor
  /// says. It must not add or remove sources.
  std::function<bool()> prepare;
  bool onLoop = false;
  /// When it was last served, as a running number: sources of equal order take turns by it.
  std::uint64_t served = 0;
};

/// The shortest time between two firings; shorter intervals are held at it, so that no timer spins the loop.
inline constexpr Nanoseconds kShortestPeriod = 1'000'000;
/// The farthest from zero that a first firing or an interval may be, 73 years: sums of them stay in range.
inline constexpr Nanoseconds kFarthest = Nanoseconds{1} << 61;

/// Fires at first + n × period. What was missed is dropped: a late timer fires once, and comes next at the
/// first scheduled time still ahead when that firing began.
struct Timer final : HostObject {
  static constexpr Kind kKind = Kind::Timer;
  /// Both times are held within the bounds above.
  Timer(Nanoseconds firstFiring, Nanoseconds interval, HostTimerCallback function, void* data);

  const Nanoseconds first;
  const Nanoseconds period;
  const HostTimerCallback callback;
  void* const context;
  /// Number of the firing that comes next, 0 the first.
  std::int64_t firing = 0;
  /// Ranks timers due at the same time.
  const std::uint64_t created;
  bool onLoop = false;
  /// Off the loop for ever.
  bool invalidated = false;
};

/// A number that is another one in every pass of the loop.
std::uint64_t turn();

/// Told of every timer that goes on the loop (true) and leaves it (false).
void setTimerObserver(std::function<void(const Timer& timer, bool started)> observer);

/// Lets SIGTERM and SIGINT end the loop, as a terminate message does, and ignores SIGPIPE. A signal that
/// comes after this call and before the run ends the run in its first pass. Both are blocked from here on,
/// which programs started by this process inherit unless their starter undoes it.
void endLoopOnSignals();

/// Whether such a signal has come.
bool endedBySignal();

}  // namespace base
