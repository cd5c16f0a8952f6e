#include "platform/linux/players/scan.h"

#include <algorithm>
#include <chrono>
#include <cmath>
#include <list>
#include <utility>

#include "platform/host.h"
#include "platform/tarnscript/tarnscript.h"

namespace linux::players {

namespace {

/// How often a scan seeks, in seconds.
constexpr double kInterval = 0.25;
/// The longest step that a seek makes up for, when the machine slept or the loop was held up.
constexpr std::chrono::seconds kLongestStep{2};
/// A scan forward ends so far before the end, in microseconds: what plays then ends by itself.
constexpr std::int64_t kBeforeEnd = 1'000'000;

/// Faster than anything is of use.
constexpr double kFastest = 1000;

struct Scan {
  std::string owner;
  double rate;
  /// What the player did when the scan began. Whoever changes that ends the scan; that it does something
  /// else for one step may come from the seek.
  PlaybackStatus status;
  bool strayed;
  /// It was paused for the scan, and has not been seen so yet; and it is to play when the scan ends.
  bool awaitsPause, resumes;
  /// What is scanned, and where in it the scan stands. Players that seek to the nearest key frame or answer
  /// with an old position do not hold it up.
  std::string trackID;
  std::string url;
  std::int64_t position;
  /// When it stood there.
  base::Clock::time_point when;
  HostTimerRef timer;
};

std::list<Scan> sScans;

std::list<Scan>::iterator scanOf(const Player& player) {
  return std::find_if(sScans.begin(), sScans.end(),
                      [&](const Scan& scan) { return scan.owner == player.callee.name; });
}

void end(std::list<Scan>::iterator scan) {
  HostInvalidateTimer(scan->timer);
  HostRelease(scan->timer);
  sScans.erase(scan);
}

void endAndResume(std::list<Scan>::iterator scan) {
  Player* const player = scan->resumes ? findPlayer(scan->owner) : nullptr;
  end(scan);
  if (player != nullptr) play(*player);
}

/// One seek. False when the scan has come to an end.
bool step(Scan& scan) {
  Player* const player = findPlayer(scan.owner);
  if (player == nullptr) return false;
  const PlayerState state = stateOf(*player);
  if (state.told == scan.status) scan.awaitsPause = false;
  const bool strays = state.told != scan.status && !scan.awaitsPause;
  const bool strayedBefore = std::exchange(scan.strayed, strays);
  if (strays && strayedBefore) {
    scan.resumes = false;
    return false;
  }
  if (state.trackID != scan.trackID || state.url != scan.url) {
    scan.trackID = state.trackID;
    scan.url = state.url;
    scan.position = state.position;
  }
  const auto now = base::Clock::now();
  const std::chrono::duration<double, std::micro> passed =
      std::min<base::Clock::duration>(now - scan.when, kLongestStep);
  scan.position += static_cast<std::int64_t>(scan.rate * passed.count());
  scan.when = now;
  const bool atBeginning = scan.position <= 0;
  const bool atEnd = state.length && scan.position >= *state.length - kBeforeEnd;
  seekTo(*player, state, atEnd ? *state.length - kBeforeEnd : scan.position);
  return !atBeginning && !atEnd;
}

void tick(HostTimerRef timer, void*) {
  const auto scan =
      std::find_if(sScans.begin(), sScans.end(), [&](const Scan& one) { return one.timer == timer; });
  if (scan == sScans.end()) return;
  bool goesOn = false;
  try {
    goesOn = step(*scan);
  } catch (const tarnscript::Refusal&) {
    // A player that does not answer or cannot seek is not scanned any longer.
  }
  try {
    if (!goesOn) endAndResume(scan);
  } catch (const tarnscript::Refusal&) {
    // Nobody waits to be told.
  }
}

}  // namespace

void scan(Player& player, double rate) {
  if (!std::isfinite(rate)) throw tarnscript::Refusal{"that is no rate"};
  rate = std::clamp(rate, -kFastest, kFastest);
  const auto present = scanOf(player);
  if (present != sScans.end()) {
    present->rate = rate;
    return;
  }
  PlayerState state = stateOf(player);
  if (!state.canSeek || state.status == PlaybackStatus::Stopped) {
    throw tarnscript::Refusal{"there is nothing to scan through"};
  }
  const bool rests = (player.quirks & kStallsOnSeeks) != 0 && state.status == PlaybackStatus::Playing;
  if (rests) {
    pause(player);
    state.status = PlaybackStatus::Paused;
  }
  const HostTimerRef timer =
      HostCreateRepeatingTimer(HostAbsoluteTime() + kInterval, kInterval, tick, nullptr);
  if (!timer) throw tarnscript::Refusal{"there is no timer"};
  sScans.push_back({player.callee.name, rate, state.status, false, rests, rests, state.trackID, state.url,
                    state.position, base::Clock::now(), timer});
  HostRunLoopAddTimer(HostRunLoopCurrent(), timer, HostRunLoopMode::Default);
}

void endScan(Player& player) {
  const auto present = scanOf(player);
  if (present != sScans.end()) endAndResume(present);
}

void giveUpScan(const Player& player) {
  const auto present = scanOf(player);
  if (present != sScans.end()) end(present);
}

std::optional<double> scanRate(const Player& player) {
  const auto present = scanOf(player);
  if (present == sScans.end()) return std::nullopt;
  return present->rate;
}

}  // namespace linux::players
