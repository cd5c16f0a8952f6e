#include "platform/linux/players/vlc.h"

#include <charconv>
#include <string>

#include "platform/base/run_loop.h"
#include "platform/tarnscript/tarnscript.h"

namespace linux::players {

namespace {

using system::Channel;
using system::Listener;

/// What was told last, and by which process.
struct Told {
  pid_t process = 0;
  std::optional<Place> place;
};

/// The turn of the loop in which it was last found busy with another client. That VLC itself hangs would
/// have shown on the bus.
std::optional<std::uint64_t> sBusy;

/// No disc has so many titles or chapters: what is beyond is garbage.
constexpr int kMostPlaces = 65'536;

/// Finds "2/3" in a line, whatever the words around it and their language.
std::optional<Place> placeIn(std::string_view line) {
  constexpr std::string_view kDigits = "0123456789";
  const std::size_t slash = line.find('/');
  if (slash == std::string_view::npos || slash == 0) return std::nullopt;
  const std::size_t before = line.find_last_not_of(kDigits, slash - 1);
  const std::size_t first = before == std::string_view::npos ? 0 : before + 1;
  Place place;
  const char* const end = line.data() + line.size();
  if (std::from_chars(line.data() + first, end, place.number).ec != std::errc() ||
      std::from_chars(line.data() + slash + 1, end, place.count).ec != std::errc() ||
      place.number > kMostPlaces) {
    return std::nullopt;
  }
  return place;
}

/// Asks a question that is one word. Its answer ends with a line that begins with that word; what has
/// happened to VLC meanwhile stands in lines between.
std::optional<Place> ask(const Listener& listener, const std::string& question) {
  if (sBusy == base::turn()) return std::nullopt;
  Channel channel(listener, system::kQueryLimit);
  if (!channel.isOpen() || !channel.write(question + "\n")) return std::nullopt;
  std::optional<Place> place;
  while (const auto line = channel.readLine()) {
    if (line->starts_with(question + ":")) return place;
    if (line->starts_with("status change:")) continue;
    if (const auto found = placeIn(*line)) place = found;
  }
  if (channel.timedOut()) sBusy = base::turn();
  return std::nullopt;
}

/// While VLC is paused it does not tell: then as it told last.
std::optional<Place> askOrRemember(const Listener& listener, const std::string& question, Told& last) {
  if (last.process != listener.process) last = {listener.process, std::nullopt};
  if (const auto place = ask(listener, question)) last.place = place;
  return last.place;
}

void carryOut(const Listener& listener, std::string_view line) {
  Channel channel(listener, system::kCommandLimit);
  if (!channel.isOpen() || !channel.write(std::string(line) + "\n")) {
    throw tarnscript::Refusal{"VLC does not take commands"};
  }
}

std::optional<Place> title(const Listener& listener) {
  static Told last;
  return askOrRemember(listener, "title", last);
}

/// VLC counts chapters from 0, and titles from 1.
std::optional<Place> chapter(const Listener& listener) {
  static Told last;
  auto place = askOrRemember(listener, "chapter", last);
  if (place) ++place->number;
  return place;
}

void goToChapter(const Listener& listener, int from, int to, bool plays) {
  // A paused VLC takes no numbers.
  if (plays) {
    carryOut(listener, "chapter " + std::to_string(to - 1));
  } else {
    carryOut(listener, to > from ? "key key-chapter-next" : "key key-chapter-prev");
  }
}

void goToTitle(const Listener& listener, int wanted, std::int64_t seconds) {
  carryOut(listener, "title " + std::to_string(wanted));
  carryOut(listener, "seek " + std::to_string(seconds));
}

}  // namespace

const ProgramChannel kVlcChannel{
    .command = carryOut,
    .showText = nullptr,
    .title = title,
    .chapter = chapter,
    .goToChapter = goToChapter,
    .goToTitle = goToTitle,
};

}  // namespace linux::players
