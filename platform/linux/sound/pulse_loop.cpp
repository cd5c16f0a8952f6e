#include "platform/linux/sound/pulse_loop.h"

#include <pulse/timeval.h>
#include <sys/epoll.h>

#include <algorithm>
#include <memory>
#include <optional>
#include <utility>
#include <vector>

#include "platform/base/file_descriptor.h"
#include "platform/base/run_loop.h"

using base::Clock;

/// What every event of libpulse has. One that it has freed is dead until the round of events is over.
template <typename Callback, typename Destroy>
struct PulseEvent {
  Callback callback = nullptr;
  Destroy destroy = nullptr;
  void* userdata = nullptr;
  bool dead = false;
};

/// A descriptor that libpulse watches. It never watches one twice.
struct pa_io_event : PulseEvent<pa_io_event_cb_t, pa_io_event_destroy_cb_t> {
  int descriptor = -1;
};

struct pa_time_event : PulseEvent<pa_time_event_cb_t, pa_time_event_destroy_cb_t> {
  /// When it is due, as libpulse said it, and on the run loop's clock; nothing once it has fired.
  timeval wallClock{};
  std::optional<Clock::time_point> due;
};

/// Called once in every round while it is enabled.
struct pa_defer_event : PulseEvent<pa_defer_event_cb_t, pa_defer_event_destroy_cb_t> {
  bool enabled = true;
};

namespace linux::sound {

namespace {

template <typename Event>
using Events = std::vector<std::unique_ptr<Event>>;

// Kept to the end of the process: a context that goes at exit still frees its events.
auto& sDescriptors = *new Events<pa_io_event>;
auto& sTimes = *new Events<pa_time_event>;
auto& sDeferred = *new Events<pa_defer_event>;

base::Owned<base::Timer> sTimer;
/// When that timer is due.
std::optional<Clock::time_point> sArmed;

int epollSet() {
  static const base::FileDescriptor set(epoll_create1(EPOLL_CLOEXEC));
  return set.get();
}

// ---- A round of events

/// The events as they stand now: callbacks make new ones.
template <typename Event>
std::vector<Event*> snapshot(const Events<Event>& events) {
  std::vector<Event*> present;
  for (const auto& event : events) present.push_back(event.get());
  return present;
}

/// Ends the events that libpulse has freed. Their destroy callbacks may free further ones.
template <typename Event>
void bury(Events<Event>& events) {
  for (;;) {
    const auto dead = std::ranges::find_if(events, [](const auto& event) { return event->dead; });
    if (dead == events.end()) return;
    const std::unique_ptr<Event> buried = std::move(*dead);
    events.erase(dead);
    if (buried->destroy != nullptr) buried->destroy(&pulseLoop(), buried.get(), buried->userdata);
  }
}

bool anythingDeferred() {
  return std::ranges::any_of(sDeferred, [](const auto& event) { return event->enabled && !event->dead; });
}

std::optional<Clock::time_point> earliestTime() {
  std::optional<Clock::time_point> earliest;
  for (const auto& event : sTimes) {
    if (event->dead || !event->due) continue;
    earliest = earliest ? std::min(*earliest, *event->due) : *event->due;
  }
  return earliest;
}

void serveDeferred() {
  for (pa_defer_event* event : snapshot(sDeferred)) {
    if (event->enabled && !event->dead) event->callback(&pulseLoop(), event, event->userdata);
  }
}

void serveTimes() {
  const Clock::time_point now = Clock::now();
  for (pa_time_event* event : snapshot(sTimes)) {
    if (event->dead || !event->due || *event->due > now) continue;
    event->due.reset();
    const timeval due = event->wallClock;
    event->callback(&pulseLoop(), event, &due, event->userdata);
  }
}

pa_io_event_flags_t toPulse(std::uint32_t ready) {
  int flags = PA_IO_EVENT_NULL;
  if ((ready & EPOLLIN) != 0) flags |= PA_IO_EVENT_INPUT;
  if ((ready & EPOLLOUT) != 0) flags |= PA_IO_EVENT_OUTPUT;
  if ((ready & EPOLLHUP) != 0) flags |= PA_IO_EVENT_HANGUP;
  if ((ready & EPOLLERR) != 0) flags |= PA_IO_EVENT_ERROR;
  return static_cast<pa_io_event_flags_t>(flags);
}

std::uint32_t toEpoll(pa_io_event_flags_t flags) {
  return ((flags & PA_IO_EVENT_INPUT) != 0 ? std::uint32_t{EPOLLIN} : 0) |
         ((flags & PA_IO_EVENT_OUTPUT) != 0 ? std::uint32_t{EPOLLOUT} : 0);
}

void serveDescriptors(int milliseconds) {
  epoll_event ready[8];
  const int count = epoll_wait(epollSet(), ready, std::size(ready), milliseconds);
  for (int i = 0; i < count; ++i) {
    auto* event = static_cast<pa_io_event*>(ready[i].data.ptr);
    if (event->dead) continue;
    event->callback(&pulseLoop(), event, event->descriptor, toPulse(ready[i].events), event->userdata);
  }
}

void armTimer() {
  const auto earliest = earliestTime();
  if (earliest == sArmed) return;
  sArmed = earliest;
  HostInvalidateTimer(HostTimerRef(sTimer.get()));
  sTimer.reset();
  if (!earliest) return;
  const auto serve = [](HostTimerRef, void*) { servePulse(); };
  sTimer.reset(new base::Timer(earliest->time_since_epoch().count(), base::kFarthest, serve, nullptr));
  HostRunLoopAddTimer(HostRunLoopCurrent(), HostTimerRef(sTimer.get()), HostRunLoopMode::Default);
}

/// Whole milliseconds until the deadline or the next of libpulse's own times, rounded up: a wait that is too
/// short would be a busy one.
int untilNext(const base::Deadline& deadline) {
  const auto earliest = earliestTime();
  if (!earliest) return deadline.milliseconds();
  const auto left = std::chrono::ceil<std::chrono::milliseconds>(*earliest - Clock::now());
  return std::clamp(static_cast<int>(left.count()), 0, deadline.milliseconds());
}

void serveRound(int milliseconds) {
  serveDeferred();
  serveTimes();
  serveDescriptors(anythingDeferred() ? 0 : milliseconds);
  bury(sDescriptors);
  bury(sTimes);
  bury(sDeferred);
}

// ---- What libpulse calls

/// A new event, lent to libpulse until it frees it.
template <typename Event, typename Callback>
Event* make(Events<Event>& events, Callback callback, void* userdata) {
  Event* event = events.emplace_back(std::make_unique<Event>()).get();
  event->callback = callback;
  event->userdata = userdata;
  return event;
}

void watch(pa_io_event* event, int operation, pa_io_event_flags_t flags) {
  epoll_event interest{.events = toEpoll(flags), .data = {.ptr = event}};
  epoll_ctl(epollSet(), operation, event->descriptor, &interest);
}

pa_io_event* newDescriptor(pa_mainloop_api*, int descriptor, pa_io_event_flags_t flags,
                           pa_io_event_cb_t callback, void* userdata) {
  pa_io_event* const event = make(sDescriptors, callback, userdata);
  event->descriptor = descriptor;
  watch(event, EPOLL_CTL_ADD, flags);
  return event;
}

void freeDescriptor(pa_io_event* event) {
  // At once, while the descriptor is still open.
  watch(event, EPOLL_CTL_DEL, PA_IO_EVENT_NULL);
  event->dead = true;
}

/// libpulse counts in wall-clock time.
void restartTime(pa_time_event* event, const timeval* wallClock) {
  event->due.reset();
  if (wallClock == nullptr) return;
  event->wallClock = *wallClock;
  timeval now{};
  pa_gettimeofday(&now);
  const pa_usec_t ahead = pa_timeval_cmp(wallClock, &now) > 0 ? pa_timeval_diff(wallClock, &now) : 0;
  event->due = Clock::now() + std::chrono::microseconds(ahead);
}

pa_time_event* newTime(pa_mainloop_api*, const timeval* wallClock, pa_time_event_cb_t callback,
                       void* userdata) {
  pa_time_event* const event = make(sTimes, callback, userdata);
  restartTime(event, wallClock);
  return event;
}

pa_defer_event* newDeferred(pa_mainloop_api*, pa_defer_event_cb_t callback, void* userdata) {
  return make(sDeferred, callback, userdata);
}

template <typename Event>
void markDead(Event* event) {
  event->dead = true;
}

template <typename Event, typename Callback>
void setDestroy(Event* event, Callback callback) {
  event->destroy = callback;
}

/// Puts libpulse's events on the run loop; the source is never taken off.
void addSource() {
  auto* source = new base::Source(epollSet(), 0, [] { servePulse(); });
  source->immortal = true;
  source->prepare = anythingDeferred;
  HostRunLoopAddSource(HostRunLoopCurrent(), HostSourceRef(source), HostRunLoopMode::Default);
}

}  // namespace

pa_mainloop_api& pulseLoop() {
  static pa_mainloop_api api{
      .userdata = nullptr,
      .io_new = newDescriptor,
      .io_enable = [](pa_io_event* event, pa_io_event_flags_t flags) { watch(event, EPOLL_CTL_MOD, flags); },
      .io_free = freeDescriptor,
      .io_set_destroy = setDestroy<pa_io_event, pa_io_event_destroy_cb_t>,
      .time_new = newTime,
      .time_restart = restartTime,
      .time_free = markDead<pa_time_event>,
      .time_set_destroy = setDestroy<pa_time_event, pa_time_event_destroy_cb_t>,
      .defer_new = newDeferred,
      .defer_enable = [](pa_defer_event* event, int enabled) { event->enabled = enabled != 0; },
      .defer_free = markDead<pa_defer_event>,
      .defer_set_destroy = setDestroy<pa_defer_event, pa_defer_event_destroy_cb_t>,
      .quit = [](pa_mainloop_api*, int) {},
  };
  static const bool added = (addSource(), true);
  static_cast<void>(added);
  return api;
}

bool servePulse(const std::function<bool()>& done, const base::Deadline& deadline) {
  serveRound(0);
  bool isDone = done();
  while (!isDone && !deadline.hasPassed()) {
    serveRound(untilNext(deadline));
    isDone = done();
  }
  armTimer();
  return isDone;
}

void servePulse() {
  serveRound(0);
  armTimer();
}

}  // namespace linux::sound
