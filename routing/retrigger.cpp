#include "routing/retrigger.h"

#include "routing/dispatcher.h"

HostTimerRef sRetriggerTimer;

namespace {

constexpr double kFirstRepeat = 1.05;  // seconds

HIDEvent sRetriggerReport;
std::int32_t sRetriggerValue = 0;
/// When repeating must stop, in seconds of absolute time; 0 means no limit.
double sRetriggerEnd = 0;

}  // namespace

void retrigger(HIDEvent event, std::int32_t value, double period, double duration) {
  if (value == 0 || sRetriggerTimer) return;
  sRetriggerReport = event;
  sRetriggerValue = value;
  sRetriggerEnd = duration > 0 ? HostAbsoluteTime() + duration : 0;
  sRetriggerTimer =
      HostCreateRepeatingTimer(HostAbsoluteTime() + kFirstRepeat, period, retriggerCallback, nullptr);
  HostRunLoopAddTimer(HostRunLoopCurrent(), sRetriggerTimer, HostRunLoopMode::Default);
}

void retriggerCallback(HostTimerRef, void*) {
  if (!sRetriggerTimer) return;
  if (sRetriggerEnd > 0 && HostAbsoluteTime() > sRetriggerEnd) return stopRetrigger();
  // Below the dispatcher's entry: a repeat neither ends itself nor looks for another target.
  doDispatch(PackHIDEvent(sRetriggerReport), sRetriggerValue, sScreenLocked);
}

void stopRetrigger() {
  if (!sRetriggerTimer) return;
  HostInvalidateTimer(sRetriggerTimer);
  HostRelease(sRetriggerTimer);
  sRetriggerTimer = nullptr;
  sRetriggerValue = 0;
  sRetriggerEnd = 0;
}
