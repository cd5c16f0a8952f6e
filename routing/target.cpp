#include "routing/target.h"

#include "adapters/lyrabox.h"
#include "adapters/slidewell.h"
#include "adapters/spindle.h"
#include "adapters/vistremeplayer.h"
#include "adapters/vistremeplayerx.h"
#include "registry/registry.h"

AppCode sTargetApplication = App::Nval;

namespace {

/// The last target that was found in front or playing.
AppCode sLastActiveApp = App::Nval;

struct FrontRow {
  const char* bundleIdentifier;
  AppCode code;
};

constexpr FrontRow kFrontOrder[] = {
    {Bundle::Lyrabox, App::Lyra},   {Bundle::Snapvale, App::Snap},       {Bundle::Lumbra, App::Lumb},
    {Bundle::Spindle, App::Spin},   {Bundle::VistremePlayer, App::Vist}, {Bundle::VistremePlayerX, App::VstX},
    {Bundle::Slidewell, App::Slid},
};

struct Candidate {
  AppCode code;
  bool (*isRunning)();
  bool (*isPlaying)();
};

bool SpindleIsActive() { return Spindle_IsPlaying() || Spindle_AtMenu(); }

constexpr Candidate kActiveOrder[] = {
    {App::Lyra, LyraboxIsRunning, LyraboxIsPlaying},
    {App::Spin, SpindleIsRunning, SpindleIsActive},
    {App::VstX, VistremePlayerXIsRunning, VistremePlayerX_IsPlaying},
    {App::Vist, VistremePlayerIsRunning, VistremePlayer_IsPlaying},
    {App::Slid, SlidewellIsRunning, Slidewell_IsPlaying},
};

struct Player {
  AppCode code;
  bool (*isRunning)();
};

constexpr Player kLastActiveOrder[] = {
    {App::Spin, SpindleIsRunning},
    {App::VstX, VistremePlayerXIsRunning},
    {App::Vist, VistremePlayerIsRunning},
    {App::Lyra, LyraboxIsRunning},
};

constexpr Player kPriorityOrder[] = {
    {App::Lyra, LyraboxIsRunning},
    {App::Spin, SpindleIsRunning},
    {App::VstX, VistremePlayerXIsRunning},
    {App::Vist, VistremePlayerIsRunning},
};

}  // namespace

AppCode targetApplication() {
  if (sTargetApplication != App::Nval) return sTargetApplication;

  sTargetApplication = FrontApplication();
  if (sTargetApplication == App::None) sTargetApplication = activeApplication();
  if (sTargetApplication != App::None) {
    sLastActiveApp = sTargetApplication;
    return sTargetApplication;
  }
  sTargetApplication = lastActiveApplication();
  if (sTargetApplication == App::None) sTargetApplication = prioritizedApplication();
  return sTargetApplication;
}

AppCode FrontApplication() {
  const HostSerialNumberRef front = HostCopyFrontApplication(kHostDefaultSession);
  if (!front) return App::None;
  const HostStringRef key = HostGetBundleIdentifierKey();
  const HostDictionaryRef information = HostCopyApplicationInformation(kHostDefaultSession, front, key);
  if (!information) {
    HostRelease(front);
    return App::None;
  }
  const HostStringRef identifier = HostAsString(HostDictionaryGetValue(information, key));
  AppCode code = App::None;
  for (const FrontRow& row : kFrontOrder) {
    if (HostStringsAreEqual(identifier, HostGetConstantString(row.bundleIdentifier))) {
      code = row.code;
      break;
    }
  }
  HostRelease(front);
  HostRelease(information);
  return code;
}

AppCode activeApplication() {
  for (const Candidate& candidate : kActiveOrder) {
    if (candidate.isRunning() && candidate.isPlaying()) return candidate.code;
  }
  return App::None;
}

AppCode lastActiveApplication() {
  for (const Player& player : kLastActiveOrder) {
    if (sLastActiveApp == player.code && player.isRunning()) return player.code;
  }
  sLastActiveApp = App::None;
  return App::None;
}

AppCode prioritizedApplication() {
  for (const Player& player : kPriorityOrder) {
    if (player.isRunning()) return player.code;
  }
  return App::None;
}
