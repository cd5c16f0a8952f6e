#include "platform/linux/players/vlc_channel.h"

#include <charconv>

#include "platform/base/run_loop.h"
#include "platform/linux/system/channel.h"
#include "platform/tarnscript/tarnscript.h"

namespace desktop {

namespace {

constexpr std::string_view kExecutable = "vlc";

/// What was told last, and by which process.
struct Told {
  pid_t process = 0;
  std::optional<VlcPlace> place;
};

/// The turn of the loop in which it was last found busy with another client. That VLC itself hangs would
/// have shown on the bus.
std::optional<std::uint64_t> sBusy;

/// Finds "2/3" in a line, whatever the words around it and their language.
std::optional<VlcPlace> placeIn(std::string_view line) {
  constexpr std::string_view kDigits = "0123456789";
  const std::size_t slash = line.find('/');
  if (slash == std::string_view::npos || slash == 0) return std::nullopt;
  const std::size_t before = line.find_last_not_of(kDigits, slash - 1);
  const std::size_t first = before == std::string_view::npos ? 0 : before + 1;
  VlcPlace place;
  const char* const end = line.data() + line.size();
  if (std::from_chars(line.data() + first, end, place.number).ec != std::errc() ||
      std::from_chars(line.data() + slash + 1, end, place.count).ec != std::errc()) {
    return std::nullopt;
  }
  return place;
}

/// Asks a question that is one word. Its answer ends with a line that begins with that word; what has
/// happened to VLC meanwhile stands in lines between.
std::optional<VlcPlace> ask(pid_t process, const std::string& question) {
  if (sBusy == base::turn()) return std::nullopt;
  Channel channel(process, kExecutable, kQueryLimit);
  if (!channel.isOpen() || !channel.write(question + "\n")) return std::nullopt;
  std::optional<VlcPlace> place;
  while (const auto line = channel.readLine()) {
    if (line->starts_with(question + ":")) return place;
    if (line->starts_with("status change:")) continue;
    if (const auto found = placeIn(*line)) place = found;
  }
  if (channel.timedOut()) sBusy = base::turn();
  return std::nullopt;
}

std::optional<VlcPlace> askOrRemember(pid_t process, const std::string& question, Told& last) {
  if (last.process != process) last = {process, std::nullopt};
  if (const auto place = ask(process, question)) last.place = place;
  return last.place;
}

}  // namespace

bool hasVlcChannel(pid_t process) { return !channelPath(process, kExecutable).empty(); }

void vlcCommand(pid_t process, std::string_view line) {
  Channel channel(process, kExecutable, kCommandLimit);
  if (!channel.isOpen() || !channel.write(std::string(line) + "\n")) {
    throw tarnscript::Refusal{"VLC does not take commands"};
  }
}

std::optional<VlcPlace> vlcTitle(pid_t process) {
  static Told last;
  return askOrRemember(process, "title", last);
}

std::optional<VlcPlace> vlcChapter(pid_t process) {
  static Told last;
  return askOrRemember(process, "chapter", last);
}

}  // namespace desktop
