// What a player tells over the session bus (MPRIS 2.2): who it is, its state, its signals.

#include <cmath>
#include <string>

#include "fuzz/bus.h"
#include "fuzz/fuzz.h"
#include "platform/linux/players/mpris.h"
#include "platform/linux/players/players.h"
#include "platform/tarnscript/tarnscript.h"
#include "platform/text/utf8.h"

namespace {

namespace players = linux::players;
using fuzz::require;

/// There is a player, unless an input knows better.
constexpr char kPlayer[] =
    "\nListNames as 1 org.mpris.MediaPlayer2.player\nGetNameOwner s :1.7\nGetConnectionUnixProcessID u 42\n";

bool isWithin(double number, double least, double most) { return number >= least && number <= most; }

void check(const players::PlayerState& state) {
  constexpr std::int64_t kLongest = 1'000LL * 3600 * 1'000'000 * 1000;
  require(isWithin(state.rate, -100, 100) && state.rate != 0, "a rate can be played");
  require(isWithin(state.minimumRate, -100, 100) && isWithin(state.maximumRate, -100, 100),
          "and so can its bounds");
  require(isWithin(state.volume, 0, 10), "a volume can be heard");
  require(state.position >= 0 && state.position <= kLongest, "a position is a time");
  require(!state.length || (*state.length > 0 && *state.length <= kLongest), "a length is a time");
  require(state.trackID.empty() || sd_bus_object_path_is_valid(state.trackID.c_str()) > 0,
          "a track id is a path");
  require(text::isUTF8(state.title) && state.title.size() <= 4096, "a title is text of a sane length");
}

/// Asks and tells the player all there is.
void use(players::Player& player) {
  require(player.desktopEntry.find('/') == std::string::npos, "an entry is no path");
  for (const players::Quirk quirks : {players::kNoQuirk, players::kCountsMilliseconds}) {
    player.quirks = quirks;
    try {
      const players::PlayerState state = players::stateOf(player);
      check(state);
      players::takesRate(player, state, 2);
      players::statusOf(player);
      players::seekTo(player, state, state.position + 1);
    } catch (const tarnscript::Refusal&) {
    }
  }
  players::hasMedia(player);
  players::fullscreenOf(player);
  players::trackListOf(player);
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string lines = std::string(fuzz::textOf(data, size)) + kPlayer;
  fuzz::beginBus(lines);
  for (int round = 0; round < 2; ++round) {
    players::takeInPlayers();
    for (players::Player& player : players::list()) use(player);
  }
  return 0;
}
