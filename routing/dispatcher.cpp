#include "routing/dispatcher.h"

#include "adapters/lumbra.h"
#include "adapters/lyrabox.h"
#include "adapters/slidewell.h"
#include "adapters/snapvale.h"
#include "adapters/spindle.h"
#include "adapters/vistremeplayer.h"
#include "adapters/vistremeplayerx.h"
#include "registry/bridge.h"
#include "registry/registry.h"
#include "routing/retrigger.h"
#include "routing/target.h"
#include "routing/volume.h"

bool sScreenLocked = false;

namespace {

using AdapterEntry = bool (*)(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);

struct Route {
  AppCode code;
  AdapterEntry entry;
};

/// The disc player is not here: it takes the whole event.
constexpr Route kDispatchOrder[] = {
    {App::Lyra, LyraboxHandleHIDEvent},         {App::Snap, SnapvaleHandleHIDEvent},
    {App::Lumb, LumbraHandleHIDEvent},          {App::Vist, VistremePlayerHandleHIDEvent},
    {App::VstX, VistremePlayerXHandleHIDEvent}, {App::Slid, SlidewellHandleHIDEvent},
};

bool LaunchesJukebox(UsageKey key) {
  return key == Key::SystemMenuSelect || key == Key::Play || key == Key::Pause || key == Key::PlayPause;
}

}  // namespace

bool DispatchHIDEvent(PackedHIDEvent event, std::int32_t value, bool screenLocked) {
  if (sRetriggerTimer) stopRetrigger();
  sTargetApplication = App::Nval;
  sScreenLocked = screenLocked;
  return doDispatch(event & kPackedHIDEventMask, value, screenLocked);
}

bool doDispatch(PackedHIDEvent event, std::int32_t value, bool screenLocked) {
  const std::uint32_t seed = HostGetApplicationListSeed(kHostDefaultSession);
  if (seed != gApplicationListSeed) {
    gApplicationListSeed = seed;
    refreshCachedASNs();
  }
  event &= kPackedHIDEventMask;
  if (dispatchVolumeEvent(event, value)) return true;

  const AppCode target = targetApplication();
  if (target == App::Spin) return dispatchToSpindle(event, value);
  for (const Route& route : kDispatchOrder) {
    if (target == route.code) return route.entry(UsagePageOf(event), UsageOf(event), value);
  }
  if (target == App::None && !screenLocked && LaunchesJukebox(UsageKeyOf(event))) {
    HandleScript(R"(tell application id "com.tarn.Lyrabox" to launch)");
  }
  return false;
}
