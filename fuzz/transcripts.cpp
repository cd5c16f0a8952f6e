// Transcripts, as kvd-stage plays them without a terminal: one that is played again is the same.

#include <sys/mman.h>

#include <algorithm>
#include <chrono>
#include <sstream>
#include <string>
#include <string_view>

#include "fuzz/child.h"
#include "fuzz/fuzz.h"
#include "platform/base/file_descriptor.h"
#include "platform/stage/desktop.h"
#include "platform/stage/transcript.h"
#include "remote/words.h"

namespace {

using fuzz::require;

/// An evening; a year of repeats is a long wait for whoever asks for it, and nothing else.
constexpr std::chrono::hours kLongest{3};

/// Whether it is played to its end soon: "serve" waits for other processes.
bool ends(const std::string& commands) {
  std::chrono::nanoseconds all{0};
  std::istringstream words(commands);
  for (std::string word; words >> word;) {
    if (word == "serve") return false;
    all += std::min<std::chrono::nanoseconds>(remote::readTime(word).value_or(all.zero()), kLongest);
  }
  return all < kLongest;
}

std::string play(const std::string& commands) {
  const base::FileDescriptor input(memfd_create("commands", MFD_CLOEXEC));
  require(base::writeAll(input, commands) && lseek(input.get(), 0, SEEK_SET) == 0, "there are commands");
  std::ostringstream output;
  const int status = stage::playTranscript(input.get(), output);
  require(status == 0 || status == 1, "a transcript ends with 0 or 1");
  return std::move(output).str();
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static const bool isSetUp = (stage::setUpDesktop(), true);
  const std::string commands(fuzz::textOf(data, size));
  if (!isSetUp || !ends(commands)) return 0;
  const std::string transcript = fuzz::inChild([&] { return play(commands); });
  // A play takes a process and with it some milliseconds: one in four is repeated.
  if (size % 4 != 0) return 0;
  require(fuzz::inChild([&] { return play(transcript); }) == transcript,
          "a transcript that is played again is the same");
  return 0;
}
