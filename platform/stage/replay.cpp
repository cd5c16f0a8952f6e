#include "platform/stage/replay.h"

#include <chrono>
#include <cstddef>
#include <utility>

#include "platform/base/subprocess.h"

namespace stage {

namespace {

/// The play of a whole day takes a moment; one that takes longer than this never ends.
constexpr std::chrono::seconds kLongestPlay{30};
/// Nobody could read a longer one.
constexpr std::size_t kLongestTranscript = 64 << 20;

}  // namespace

std::optional<std::string> playAgain(const std::string& commands) {
  // Its input being no terminal, it takes what it reads for a transcript.
  auto play = base::runToEnd(
      {.path = "/proc/self/exe", .arguments = {"kvd-stage"}, .input = commands, .discardsErrors = true},
      kLongestTranscript, base::Deadline(kLongestPlay));
  // A command of a transcript that was wrong, status 1, is no failure of the play; one that began tells at
  // its end what is alive.
  if (!play || play->status.value_or(2) > 1) return std::nullopt;
  if (play->output.find("left alive") == std::string::npos) return std::nullopt;
  return std::move(play->output);
}

}  // namespace stage
