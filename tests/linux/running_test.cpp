// Who is first for a role, how a program is started, how far a sound key goes, how long a button waits, and
// what comes too late.

#include "platform/linux/programs/running.h"

#include <gtest/gtest.h>
#include <sys/socket.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <thread>

#include "platform/base/service_directory.h"
#include "platform/base/signal_set.h"
#include "platform/linux/host/host.h"
#include "platform/linux/programs/launch.h"
#include "platform/linux/sound/sound_keys.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/system/channel.h"
#include "tests/linux/fake_session.h"
#include "tests/linux/fake_windows.h"
#include "tests/temporary_directory.h"

namespace {

using namespace linux;
using namespace std::chrono_literals;

TEST(Running, ButtonStaysWithWhomItWasChosenFor) {
  fake::beginSession();
  host::init({&fake::kWindows});
  fake::startProgram("one", "one", {"owns=org.mpris.MediaPlayer2.strawberry", "playing"});
  fake::startProgram("two", "two", {"owns=org.mpris.MediaPlayer2.rhythmbox"});
  programs::takeInDesktop();
  const auto chosen = programs::firstInstance(programs::Role::Jukebox)->serialNumber;
  EXPECT_EQ(chosen.low, static_cast<std::uint32_t>(fake::program("one").process));
  fake::tellProgram("one", "stopped");
  fake::tellProgram("two", "playing");
  programs::takeInDesktop();
  EXPECT_EQ(programs::firstInstance(programs::Role::Jukebox)->serialNumber, chosen);
  EXPECT_NE(programs::rankedInstances(programs::Role::Jukebox).front()->serialNumber, chosen);
  host::finish();
  fake::endSession();
}

TEST(Launch, WithoutAServiceManagerAProgramStandsOnItsOwn) {
  fake::beginSession();
  const TemporaryDirectory directory;
  // Its session, its parent, the signals that it blocks.
  std::ofstream(directory.path / "tell")
      << "set -- $(cut -d' ' -f6 /proc/$$/stat) $PPID $(sed -n 's/^SigBlk:\\s*//p' /proc/$$/status)\n"
      << "echo $(($1 == $$)) $(($2 == " << getpid() << ")) $3 >told~ && mv told~ told\n";
  fake::writeEntry(
      "player", {"Categories=AudioVideo;Audio;Player;", "Exec=sh tell", "Path=" + directory.path.string()});
  const sigset_t blocked = base::signalSet({SIGUSR1});
  sigprocmask(SIG_BLOCK, &blocked, nullptr);
  programs::launchProgramOf(programs::Role::Jukebox);
  while (!std::filesystem::exists(directory.path / "told")) std::this_thread::sleep_for(10ms);
  std::string told;
  std::getline(std::ifstream(directory.path / "told"), told);
  EXPECT_EQ(told, "1 0 0000000000000000");
  system::closeBus();
  fake::endSession();
}

TEST(SoundKeys, StepWithinTheirLimits) {
  const struct {
    bool louder, repeated;
    int before, after;
  } cases[] = {{true, false, 50, 55},  {true, true, 50, 52},    {true, false, 97, 100},
               {true, true, 99, 100},  {true, false, 140, 140}, {false, false, 140, 135},
               {false, true, 101, 99}, {false, false, 3, 0}};
  for (const auto& [louder, repeated, before, after] : cases) {
    EXPECT_EQ(sound::volumeAfter({louder, true, repeated}, before), after) << before << louder << repeated;
  }
}

TEST(Bus, AFloodIsTakenInByParts) {
  constexpr int kSignals = 1000;
  fake::beginSession();
  int taken = 0;
  const auto count = [](sd_bus_message*, void* context, sd_bus_error*) {
    return ++*static_cast<int*>(context), 0;
  };
  sd_bus_add_match(system::bus(), nullptr, "type='signal',interface='test.Flood'", count, &taken);
  sd_bus* flood = nullptr;
  sd_bus_open_user(&flood);
  for (int i = 0; i < kSignals; ++i) sd_bus_emit_signal(flood, "/flood", "test.Flood", "More", "");
  sd_bus_flush_close_unref(flood);
  for (int before = 0; taken < kSignals; before = taken) {
    ASSERT_TRUE(system::waitForBus(base::Deadline(1min)));
    system::takeInBus();
    EXPECT_LE(taken - before, 256);
  }
  system::closeBus();
  fake::endSession();
}

TEST(Turn, LosesItsPatienceAfterASecond) {
  EXPECT_EQ(system::patience(500ms), 500ms);
  system::noteWaitInVain(500ms);
  EXPECT_EQ(system::patience(500ms), 500ms);
  system::noteWaitInVain(500ms);
  EXPECT_EQ(system::patience(500ms), 20ms);
  EXPECT_EQ(system::patience(10ms), 10ms);
}

TEST(Channel, EndsInTimeThoughThereIsMoreToRead) {
  const TemporaryDirectory directory;
  const auto address = base::serviceAddress(directory.path, "channel");
  const base::FileDescriptor listening(socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0));
  ASSERT_EQ(bind(listening.get(), reinterpret_cast<const sockaddr*>(&*address), sizeof *address), 0);
  ASSERT_EQ(listen(listening.get(), 1), 0);
  system::Channel channel({getpid(), "linux_test"}, 0ms);
  ASSERT_TRUE(channel.isOpen());
  const base::FileDescriptor talker(accept(listening.get(), nullptr, nullptr));
  ASSERT_EQ(send(talker.get(), "more\n", 5, MSG_NOSIGNAL), 5);
  EXPECT_FALSE(channel.readLine()) << "what has come comes too late";
  EXPECT_TRUE(channel.timedOut());
}

}  // namespace
