#include "platform/base/timers.h"

#include <algorithm>
#include <cmath>
#include <utility>

#include "platform/base/clock.h"

namespace base {
namespace {

/// One reference to each is the loop's.
std::vector<Timer*> timers;
std::function<void(const Timer&, bool)> observe;

Nanoseconds dueTime(const Timer& timer) { return timer.first + timer.firing * timer.period; }

std::uint64_t nextCreated() {
  static std::uint64_t last = 0;
  return ++last;
}

/// Seconds, not NaN, as nanoseconds; what is too far off is held at the bound.
Nanoseconds toNanoseconds(double seconds) {
  constexpr auto bound = static_cast<double>(kFarthest);
  return std::llround(std::clamp(seconds * 1e9, -bound, bound));
}

void add(Timer& timer) {
  if (timer.onLoop || timer.invalidated) return;
  HostRetain(&timer);
  timers.push_back(&timer);
  timer.onLoop = true;
  if (observe) observe(timer, true);
}

void invalidate(Timer& timer) {
  timer.invalidated = true;
  if (!timer.onLoop) return;
  std::erase(timers, &timer);
  timer.onLoop = false;
  if (observe) observe(timer, false);
  HostRelease(&timer);
}

}  // namespace

Timer::Timer(Nanoseconds firstFiring, Nanoseconds interval, HostTimerCallback function, void* data)
    : HostObject(kKind),
      first(std::clamp(firstFiring, -kFarthest, kFarthest)),
      period(std::clamp(interval, kShortestPeriod, kFarthest)),
      callback(function),
      context(data),
      created(nextCreated()) {}

std::vector<Owned<Timer>> dueTimers(Nanoseconds now) {
  std::vector<Owned<Timer>> due;
  for (Timer* timer : timers) {
    if (dueTime(*timer) <= now) due.push_back(retained(timer));
  }
  std::ranges::sort(due, {}, [](const auto& timer) { return std::pair(dueTime(*timer), timer->created); });
  return due;
}

std::optional<Nanoseconds> earliestDue() {
  if (timers.empty()) return std::nullopt;
  return dueTime(**std::ranges::min_element(timers, {}, [](const Timer* timer) { return dueTime(*timer); }));
}

void fire(Timer& timer) {
  timer.firing = (timeSource().now() - timer.first) / timer.period + 1;
  timer.callback(HostTimerRef(&timer), timer.context);
}

void setTimerObserver(std::function<void(const Timer& timer, bool started)> observer) {
  observe = std::move(observer);
}

}  // namespace base

HostTimerRef HostCreateRepeatingTimer(double firstFireDate, double interval, HostTimerCallback callback,
                                      void* context) {
  // Written so that an interval that is not a number fails too.
  if (std::isnan(firstFireDate) || !(interval > 0) || callback == nullptr) return nullptr;
  return HostTimerRef(
      new base::Timer(base::toNanoseconds(firstFireDate), base::toNanoseconds(interval), callback, context));
}

void HostRunLoopAddTimer(HostRunLoopRef loop, HostTimerRef timer, HostRunLoopMode) {
  auto* added = base::as<base::Timer>(timer);
  if (loop && added != nullptr) base::add(*added);
}

void HostInvalidateTimer(HostTimerRef timer) {
  if (auto* stopped = base::as<base::Timer>(timer)) base::invalidate(*stopped);
}
