#include "report/deeds.h"

#include <utility>

#include "platform/linux/programs/launch.h"
#include "platform/linux/programs/own_words.h"
#include "platform/linux/roles/performer.h"
#include "report/names.h"

namespace report {

namespace {

using linux::programs::Action;
using linux::programs::Instance;
using linux::programs::Means;
using linux::programs::Role;
using linux::roles::Performer;

std::vector<Deed> sDeeds;

/// A key, and why it would be lost.
std::string keyWay(const Performer& performer, const std::string& key) {
  const auto* const window = performer.keyboardWindow();
  if (window == nullptr) return "key " + key + " (lost: it has no window)";
  if (linux::windows::takesKeys(window->id)) return "key " + key;
  return "key " + key + (window->isActive ? " (lost: none reaches it)" : " (lost: it is not in front)");
}

bool offersActions(const Performer& performer) {
  const auto* const window = performer.keyboardWindow();
  return window != nullptr && !window->gtk.busName.empty();
}

/// Of "NAME PATH INTERFACE MEMBER", an argument behind it too.
std::string memberIn(const std::string& how) {
  std::size_t at = 0;
  for (int word = 0; word < 3; ++word) at = how.find(' ', at + 1);
  return at != std::string::npos ? how.substr(at) : "";
}

std::string wayOf(const Action& action, const Performer& performer) {
  const std::string how = action.how;
  switch (action.means) {
    case Means::Mpris:
      return "MPRIS2 " + how + (performer.playerIfAny() != nullptr ? "" : " (it is not on the bus)");
    case Means::Channel:
      return "its channel, " + how + (performer.channel() != nullptr ? "" : " (not open)");
    case Means::Action:
      return "its action " + how + (offersActions(performer) ? "" : " (not offered)");
    case Means::Method:
      return "its method" + memberIn(how);
    case Means::Key:
      return keyWay(performer, how);
    case Means::Nothing:
      break;
  }
  return "nothing to do";
}

std::vector<std::string> waysOf(const Instance& instance, tarnscript::Code word) {
  std::vector<std::string> ways;
  if (word == 0) return ways;
  const Performer performer(instance);
  for (const Action& action : linux::programs::actionsFor(instance.role, instance.program, word)) {
    ways.push_back(wayOf(action, performer));
  }
  return ways;
}

void noteWith(const Instance& instance, std::string words, std::vector<std::string> ways) {
  sDeeds.push_back({instance.role, nameOf(instance), instance.process, std::move(words), std::move(ways)});
}

}  // namespace

void note(Deed deed) { sDeeds.push_back(std::move(deed)); }

void noteFor(const Instance& instance, std::string words, tarnscript::Code word) {
  noteWith(instance, std::move(words), waysOf(instance, word));
}

void noteKey(const Instance& instance, std::uint16_t virtualKey, bool withShift) {
  const std::string key = keyName(virtualKey, withShift);
  auto ways = waysOf(instance, linux::programs::words::wordForKey(virtualKey, withShift));
  noteWith(instance, ways.empty() ? keyWay(Performer(instance), key) : "key " + key, std::move(ways));
}

void noteStart(Role role) {
  const auto* const entry = linux::programs::defaultProgramOf(role);
  const std::string kind(wordsFor(role));
  if (entry == nullptr) return note({role, "nobody", 0, "no " + kind + " is installed to be started", {}});
  const auto* const known = linux::programs::programByEntry(entry->id);
  note({role, known != nullptr ? known->name : entry->id, 0, "start", {}});
}

std::vector<Deed> takeDeeds() { return std::exchange(sDeeds, {}); }

}  // namespace report
