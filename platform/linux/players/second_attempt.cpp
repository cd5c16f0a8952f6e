#include "platform/linux/players/second_attempt.h"

#include <limits>
#include <string>

#include "platform/host.h"
#include "platform/linux/players/mpris.h"
#include "platform/tarnscript/tarnscript.h"

namespace linux::players {

namespace {

/// How long a player may take to begin, in seconds.
constexpr double kMoment = 1;
/// It is looked at once.
constexpr double kNever = std::numeric_limits<double>::infinity();

/// The attempt that is under way: whose, and what had been done to players until then.
std::string sOwner;
std::uint64_t sChanges = 0;
HostTimerRef sTimer;

void look(HostTimerRef timer, void*) {
  HostInvalidateTimer(timer);
  HostRelease(timer);
  sTimer = nullptr;
  Player* const player = findPlayer(sOwner);
  if (player == nullptr || playbackChanges() != sChanges) return;
  try {
    toggleToPlay(*player);
  } catch (const tarnscript::Refusal&) {
    // Whoever does not answer now will not play by itself either.
  }
}

}  // namespace

void attemptAgain(const Player& player) {
  sOwner = player.callee.name;
  sChanges = playbackChanges();
  if (sTimer) {
    HostInvalidateTimer(sTimer);
    HostRelease(sTimer);
  }
  sTimer = HostCreateRepeatingTimer(HostAbsoluteTime() + kMoment, kNever, look, nullptr);
  if (sTimer) HostRunLoopAddTimer(HostRunLoopCurrent(), sTimer, HostRunLoopMode::Default);
}

}  // namespace linux::players
