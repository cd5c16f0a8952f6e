#include "simulator/failing_host.h"

#include <cstdint>
#include <cstdio>
#include <iterator>
#include <optional>

#include "platform/stage/desktop.h"
#include "simulator/failures.h"
#include "simulator/operations.h"
#include "simulator/promises.h"
#include "simulator/rehearsal.h"

namespace simulator {

namespace {

/// Whatever the scene has come to: all is well again, the jukebox stands in front and gets a button.
const std::string kNextButton[] = {
    "mend window-server",
    "mend display-query",
    "mend process-lookup",
    "mend event-records",
    "answers lyrabox normally",
    "wait 5m",
    "open lyrabox",
    "front lyrabox",
    "tell lyrabox to stop",
    "tap play",
};

std::optional<Failure> play(const std::vector<std::string>& scene, std::uint64_t failingCall) {
  std::vector<std::string> commands = scene;
  commands.insert(commands.end(), std::begin(kNextButton), std::end(kNextButton));
  std::size_t next = 0;
  const auto give = [&]() -> std::optional<std::string> {
    // By design a daemon whose port could not be made runs on and hears nothing.
    if (!daemonListens()) return std::nullopt;
    if (failingCall == 0 && next <= scene.size()) leaveWord(std::to_string(callCount()));
    if (next == scene.size()) letCallFail(0);
    if (next < commands.size()) return commands[next++];
    expectPlaying("lyrabox");
    return std::nullopt;
  };
  return rehearse({.commands = give, .prepare = [&] {
                     expectTrueDesktop(false);
                     letCallFail(failingCall);
                   }});
}

}  // namespace

bool failEachCall(const std::string& name, const std::vector<std::string>& scene) {
  const RuntimeDirectory directory;
  std::optional<Failure> failure = play(scene, 0);
  const std::uint64_t calls = failure ? 0 : std::stoull(wordLeft());
  const std::size_t parts = workerCount();
  const auto played = inParallel(parts, [&](std::size_t part) {
    for (std::uint64_t call = part + 1; call <= calls && !failure; call += parts) {
      failure = play(scene, call);
      if (failure)
        failure->what = "call " + std::to_string(call) + ", " + wordLeft() + ", fails: " + failure->what;
    }
    return failure;
  });
  if (!played) return false;
  std::printf("%s: each of %llu calls\n", name.c_str(), static_cast<unsigned long long>(calls));
  return true;
}

}  // namespace simulator
