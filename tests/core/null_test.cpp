// Every entry of the core on a host where every operation fails.

#include <gtest/gtest.h>

#include "adapters/lyrabox.h"
#include "daemon/lifecycle.h"
#include "registry/bridge.h"
#include "registry/registry.h"
#include "routing/dispatcher.h"
#include "routing/target.h"

namespace {

TEST(NullHost, EveryEntryAnswersAsItsFailureRulesSay) {
  EXPECT_EQ(KVDMain(), 1);
  EXPECT_EQ(server_handlehidevent(0, 0x0C, 0xCD, 0, 1), 0);
  EXPECT_EQ(server_setscreenlocked(0, 2), 0);
  EXPECT_TRUE(gScreenLocked);
  EXPECT_EQ(server_setscreenlocked(0, 0), 0);
  EXPECT_FALSE(gScreenLocked);
  EXPECT_EQ(server_terminate(0), 0);
  idleKillTimerCallback(nullptr, nullptr);
  registerActivity();

  refreshCachedASNs();
  for (bool (*const isRunning)() :
       {LyraboxIsRunning, SnapvaleIsRunning, LumbraIsRunning, SpindleIsRunning, VistremePlayerIsRunning,
        VistremePlayerXIsRunning, SlidewellIsRunning, DaemonIsRunning, LyraboxIsPlaying}) {
    EXPECT_FALSE(isRunning());
  }
  EXPECT_FALSE(getASNForBundleID(nullptr));
  EXPECT_FALSE(ProcessIsRunning(nullptr));
  EXPECT_EQ(FrontProcessID(), App::None);
  EXPECT_EQ(getSnapvaleVersion(), 0);
  EXPECT_FALSE(CreateDictionaryFromPList(nullptr, nullptr));

  HandleScript(nullptr);
  EXPECT_FALSE(HandleScriptWithResult("1"));
  EXPECT_EQ(HandleScriptWithIntegerResult("1"), 0);
  EXPECT_EQ(HandleScriptWithOSTypeResult("1"), 0U);
  HandleTarnEventWithCode(nullptr, 0, 0);

  EXPECT_EQ(targetApplication(), App::None);
  EXPECT_FALSE(DispatchHIDEvent(0x00CD'000C, 1, false));
  EXPECT_TRUE(LyraboxHandleHIDEvent(0x0C, 0xCD, 1)) << "the button is the jukebox's whether or not it obeys";
  EXPECT_FALSE(gRemoteUIRunning || gRemoteUIVisible);
}

}  // namespace
