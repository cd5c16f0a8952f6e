#include "platform/base/run_loop.h"

#include <gtest/gtest.h>
#include <poll.h>
#include <sys/eventfd.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cmath>
#include <csignal>
#include <deque>
#include <string>
#include <vector>

namespace {

using base::Nanoseconds;

constexpr Nanoseconds kMillisecond = 1'000'000;
constexpr double kStart = 600.0;

HostRunLoopRef loop() { return HostRunLoopCurrent(); }
void stop() { HostRunLoopStop(loop()); }
constexpr auto kMode = HostRunLoopMode::Default;
std::size_t alive(base::Kind kind) { return base::aliveByKind().at(static_cast<std::size_t>(kind)); }

/// Time moves to the next deadline when the loop waits; the run ends when nothing is due up to the horizon.
class RunLoop : public testing::Test {
 protected:
  using Action = std::function<void(HostTimerRef)>;

  RunLoop() {
    const auto wait = [this](std::optional<Nanoseconds> deadline) {
      if (!deadline || *deadline > horizon) return stop();
      now = *deadline;
    };
    base::setTimeSource({[this] { return now; }, wait, [this](Nanoseconds duration) { now += duration; }});
  }

  /// A timer that the loop alone holds.
  HostTimerRef timer(double first, double interval, Action action) {
    const auto call = [](HostTimerRef self, void* context) { (*static_cast<Action*>(context))(self); };
    const auto made =
        HostCreateRepeatingTimer(first, interval, call, &actions.emplace_back(std::move(action)));
    HostRunLoopAddTimer(loop(), made, kMode);
    HostRelease(made);
    return made;
  }
  HostTimerRef logging(double first, char mark) {
    return timer(first, 9, [this, mark](HostTimerRef) { log += mark; });
  }
  /// A source on the loop that always has data waiting.
  base::Source* readySource(std::int32_t order, std::function<void()> action) {
    auto* source = new base::Source(eventfd(1, EFD_CLOEXEC), order, std::move(action));
    HostRunLoopAddSource(loop(), HostSourceRef(source), kMode);
    HostRelease(source);
    return source;
  }

  Nanoseconds now = static_cast<Nanoseconds>(kStart) * 1000 * kMillisecond;
  Nanoseconds horizon = now + 1000 * kMillisecond;
  std::string log;
  std::deque<Action> actions;
};

TEST_F(RunLoop, TimersKeepTheirSchedule) {
  constexpr double infinity = std::numeric_limits<double>::infinity();
  const struct {
    const char* what;
    double first, interval;
    std::uint32_t callbackMilliseconds;
    std::vector<Nanoseconds> firings;  // milliseconds after the start
  } cases[] = {
      {"long past: at once, then on its own grid", 0.0, 0.7, 0, {0, 600}},
      {"ahead", kStart + 0.25, 0.25, 0, {250, 500, 750, 1000}},
      {"late through its own callback: once, the rest dropped", kStart, 0.3, 650, {0, 650}},
      {"for ever past", -infinity, infinity, 0, {0}},
      {"beyond the range", 1e300, 1e300, 0, {}},
      {"held at the shortest period", kStart + 0.998, 1e-12, 0, {998, 999, 1000}},
  };
  const Nanoseconds start = now;
  for (const auto& c : cases) {
    now = start;
    std::vector<Nanoseconds> firings;
    const HostTimerRef made = timer(c.first, c.interval, [&](HostTimerRef) {
      firings.push_back((now - start) / kMillisecond);
      HostSleepMicroseconds(c.callbackMilliseconds * 1000);
      if (now > horizon) stop();
    });
    HostRunLoopRun();
    EXPECT_EQ(firings, c.firings) << c.what;
    HostInvalidateTimer(made);
  }
  for (const double interval : {0.0, -1.0, std::nan("")}) EXPECT_FALSE(timer(0, interval, {})) << interval;
  EXPECT_FALSE(timer(std::nan(""), 1, {}));
  EXPECT_EQ(alive(base::Kind::Timer), 0u);
}

TEST_F(RunLoop, PassFiresInDueOrderWhatWasDueAndIsStillThere) {
  std::string observed;
  base::setTimerObserver([&](const base::Timer&, bool started) { observed += started ? '+' : '-'; });
  horizon = now;
  HostTimerRef victim;
  timer(kStart, 9, [&](HostTimerRef self) {
    log += 'b';
    HostInvalidateTimer(victim);
    logging(0, 'n');
    HostInvalidateTimer(self);
    HostRunLoopAddTimer(loop(), self, kMode);
  });
  logging(kStart, 'c');
  victim = logging(kStart, 'v');
  logging(kStart - 1, 'a');
  base::Source* source = readySource(0, [&] { log.size() < 5 ? void(log += '.') : stop(); });
  if (fork() == 0) {
    HostRunLoopRemoveSource(loop(), HostSourceRef(source), kMode);
    _exit(0);
  }
  wait(nullptr);  // What a child does to its loop is its own business.
  HostRunLoopRun();
  EXPECT_EQ(log, "abc.n");
  EXPECT_EQ(observed, "++++-+-");
}

TEST_F(RunLoop, OverdueTimerAndFullSourceDoNotStarveEachOther) {
  timer(0, 0.001, [&](HostTimerRef) {
    log += 't';
    HostSleepMicroseconds(5000);
    if (log.size() >= 8) stop();
  });
  for (const char mark : {'x', 'a', 'b'}) readySource(mark == 'x' ? 1 : 0, [&, mark] { log += mark; });
  HostRunLoopRun();
  EXPECT_EQ(log, "tatbtatbt");
}

TEST_F(RunLoop, SourceComesAndGoesInsideItsCallback) {
  base::Source* source = nullptr;
  source = readySource(7, [&] {
    const auto kept = log.empty() ? base::retained(source) : nullptr;
    HostRunLoopRemoveSource(loop(), HostSourceRef(source), kMode);
    if (kept != nullptr) HostRunLoopAddSource(loop(), HostSourceRef(source), kMode);
    HostRunLoopRun();  // Inside itself it returns at once.
    log += std::to_string(source->order);
  });
  HostRunLoopRun();
  EXPECT_EQ(log, "77");
  EXPECT_EQ(alive(base::Kind::Source), 0u);
}

TEST_F(RunLoop, NothingIsDeliveredAfterAStop) {
  stop();  // Without a run in progress it does nothing.
  timer(0, 1, [](HostTimerRef) { stop(); });
  logging(kStart, 't');
  readySource(0, [&] { log += 'x'; });
  HostRunLoopRun();
  EXPECT_EQ(log, "");
}

TEST_F(RunLoop, PreparedSourceIsServedThoughItsDescriptorIsSilent) {
  base::Source* source = readySource(0, [&] { log += 'x'; });
  eventfd_t value = 0;
  eventfd_read(source->fd, &value);
  source->prepare = [&] { return log.size() < 3; };
  HostRunLoopRun();
  EXPECT_EQ(log, "xxx");
}

TEST(Signals, EndTheRunEarlyOrLate) {
  base::endLoopOnSignals();
  raise(SIGPIPE);
  raise(SIGTERM);
  pollfd watched{.fd = base::runLoopDescriptor(), .events = POLLIN, .revents = 0};
  EXPECT_EQ(poll(&watched, 1, 0), 1);
  HostRunLoopRun();
  // The default wait, on the real clock.
  const auto interrupt = [](HostTimerRef, void*) { raise(SIGINT); };
  const auto timer = HostCreateRepeatingTimer(HostAbsoluteTime() + 0.002, 3600, interrupt, nullptr);
  HostRunLoopAddTimer(loop(), timer, kMode);
  HostRunLoopRun();
  EXPECT_EQ(base::as<base::Timer>(timer)->firing, 1);
}

}  // namespace
