// What mpv and VLC answer on their channels.

#include <nlohmann/json.hpp>
#include <string>

#include "fuzz/answers.h"
#include "fuzz/fuzz.h"
#include "platform/linux/players/mpv.h"
#include "platform/linux/players/vlc.h"
#include "platform/tarnscript/tarnscript.h"

namespace {

using fuzz::require;
using linux::players::kMpvChannel;
using linux::players::kVlcChannel;

const linux::system::Listener kListener{fuzz::kProcess, "player"};
/// With whom all is forgotten that was told before.
const linux::system::Listener kNobody{};

/// Does it, or refuses.
template <typename Deed>
void attempt(Deed deed) {
  try {
    deed();
  } catch (const tarnscript::Refusal&) {
  }
}

void requireOneLine(const std::string& question) {
  require(question.find('\n') == question.size() - 1, "a question is one line");
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string_view text = fuzz::textOf(data, size);
  fuzz::setAnswer(text);
  attempt([] { kMpvChannel.command(kListener, "set pause  yes"); });
  requireOneLine(fuzz::question());
  kMpvChannel.showText(kListener, text);
  const std::string question = fuzz::question();
  requireOneLine(question);
  require(nlohmann::json::accept(question), "mpv is asked in JSON");

  attempt([] { kVlcChannel.goToChapter(kListener, 1, 2, true); });
  require(fuzz::question() == "chapter 1\n", "VLC is told a chapter");
  kVlcChannel.title(kListener);
  const std::string answer = std::string(text) + "\nchapter: returned 0 (no error)\n";
  fuzz::setAnswer(answer);
  kVlcChannel.chapter(kNobody);
  const auto chapter = kVlcChannel.chapter(kListener);
  fuzz::setAnswer({});
  const auto remembered = kVlcChannel.chapter(kListener);
  require(
      chapter.has_value() == remembered.has_value() && (!chapter || chapter->number == remembered->number),
      "a place is as it was told last");
  return 0;
}
