#include "routing/silence.h"

#include "adapters/lumbra.h"
#include "adapters/lyrabox.h"
#include "adapters/slidewell.h"
#include "adapters/spindle.h"
#include "adapters/vistremeplayer.h"
#include "adapters/vistremeplayerx.h"
#include "registry/bridge.h"
#include "registry/registry.h"

namespace {

void StopSnapvaleSlideshow() {
  HandleScript(R"(tell application id "com.tarn.Snapvale"
ignoring application responses
stop slideshow
end ignoring
end)");
}

/// Alone among the rows it asks what the player does; the menu first, unlike target selection.
void SilenceSpindle() {
  if (Spindle_AtMenu()) {
    DVDCommand_Stop();
  } else if (Spindle_IsPlaying()) {
    DVDCommand_Pause();
  }
}

struct Silenced {
  AppCode code;
  bool (*isRunning)();
  void (*silence)();
};

constexpr Silenced kSilencingOrder[] = {
    {App::Lyra, LyraboxIsRunning, LyraboxCommand_Pause},
    {App::Snap, SnapvaleIsRunning, StopSnapvaleSlideshow},
    {App::Lumb, LumbraIsRunning, LumbraCommand_ExitSlideShow},
    {App::Spin, SpindleIsRunning, SilenceSpindle},
    {App::VstX, VistremePlayerXIsRunning, VistremeXCommand_Stop},
    {App::Vist, VistremePlayerIsRunning, VistremeCommand_Stop},
    {App::Slid, SlidewellIsRunning, SlidewellCommand_StopPresentation},
};

}  // namespace

void SilenceAllBut(AppCode appCode) {
  for (const Silenced& row : kSilencingOrder) {
    if (appCode != row.code && row.isRunning()) row.silence();
  }
}
