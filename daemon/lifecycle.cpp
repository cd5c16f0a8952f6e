#include "daemon/lifecycle.h"

#include "daemon/kvd.h"
#include "daemon/messages.h"
#include "registry/registry.h"
#include "routing/dispatcher.h"
#include "routing/target.h"

namespace {

constexpr double kIdleCheckInterval = 600.0;  // seconds
constexpr double kIdleLimit = 7200.0;         // seconds
constexpr std::int32_t kTransactionTracking = 16;

/// The applications that keep an idle daemon while they are in front. The professional photo application is
/// not one.
constexpr AppCode kKeepsDaemon[] = {App::Spin, App::Lyra, App::Snap, App::Vist, App::VstX, App::Slid};

/// Seconds on the platform clock at the last button message, or at start-up.
double sLastEvent = 0;
HostTimerRef sIdleKillTimer;

void Announce(const char* notification) {
  HostPostDistributedNotification(HostGetConstantString(notification), HostGetConstantString(Bundle::Daemon),
                                  nullptr, false);
}

void StartIdleKillTimer() {
  if (sIdleKillTimer) return;
  registerActivity();
  // A first fire date long past: the first check comes on the run loop's first pass.
  sIdleKillTimer = HostCreateRepeatingTimer(0.0, kIdleCheckInterval, idleKillTimerCallback, nullptr);
  HostRunLoopAddTimer(HostRunLoopCurrent(), sIdleKillTimer, HostRunLoopMode::Default);
}

void StopIdleKillTimer() {
  if (!sIdleKillTimer) return;
  HostInvalidateTimer(sIdleKillTimer);
  HostRelease(sIdleKillTimer);
  sIdleKillTimer = nullptr;
}

}  // namespace

int KVDMain() {
  mach_port_t bootstrapPort = MACH_PORT_NULL;
  if (task_get_special_port(mach_task_self(), TASK_BOOTSTRAP_PORT, &bootstrapPort) != KERN_SUCCESS) return 1;
  mach_port_t servicePort = MACH_PORT_NULL;
  if (bootstrap_check_in(bootstrapPort, kKVDServiceName, &servicePort) != KERN_SUCCESS) return 1;
  gKVDConnection = HostConnectWindowServer();
  if (gKVDConnection == 0) return 1;

  gApplicationListSeed = HostGetApplicationListSeed(kHostDefaultSession);
  refreshCachedASNs();
  HostSetLocalEventsSuppressionInterval(gKVDConnection, 0.0);

  const HostPortRef port =
      HostCreatePort(servicePort, kKVDLargestRequest, MachMessageReceivedCallback, nullptr);
  gServicePortSource = HostCreatePortSource(port, 0);
  std::int64_t ignoredPrevious = 0;
  HostEnableServiceTransactions(kTransactionTracking, 1, &ignoredPrevious);
  gRunLoop = HostRunLoopCurrent();
  HostRunLoopAddSource(gRunLoop, gServicePortSource, HostRunLoopMode::Default);
  StartIdleKillTimer();

  Announce("com.tarn.kvd.started");
  HostRunLoopRun();
  Announce("com.tarn.kvd.terminated");

  HostRelease(gServicePortSource);
  HostRelease(port);
  StopIdleKillTimer();
  return 0;
}

kern_return_t server_handlehidevent(mach_port_t, std::uint32_t usagePage, std::uint32_t usage,
                                    std::uint32_t extra, std::int32_t value) {
  HostRunLoopRemoveSource(gRunLoop, gServicePortSource, HostRunLoopMode::Default);
  registerActivity();
  const HIDEvent event{static_cast<std::uint16_t>(usagePage), static_cast<std::uint16_t>(usage),
                       static_cast<std::uint16_t>(extra)};
  DispatchHIDEvent(PackHIDEvent(event), value, gScreenLocked);
  HostRunLoopAddSource(gRunLoop, gServicePortSource, HostRunLoopMode::Default);
  return 0;
}

kern_return_t server_setscreenlocked(mach_port_t, std::uint8_t locked) {
  gScreenLocked = locked != 0;
  return 0;
}

kern_return_t server_terminate(mach_port_t) {
  HostRunLoopStop(gRunLoop);
  return 0;
}

void idleKillTimerCallback(HostTimerRef, void*) {
  for (const AppCode code : kKeepsDaemon) {
    // Asked afresh each time: the front application may change between two questions.
    if (FrontApplication() == code) return;
  }
  if (HostAbsoluteTime() - sLastEvent > kIdleLimit) HostRunLoopStop(gRunLoop);
}

void registerActivity() { sLastEvent = HostAbsoluteTime(); }
