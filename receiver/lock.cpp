#include "receiver/lock.h"

#include <algorithm>
#include <string>
#include <utility>

#include "receiver/bus.h"

namespace receiver {
namespace {

struct Name {
  const char* name;
  const char* path;
};

constexpr std::array<Name, 2> kSavers = {{
    {"org.freedesktop.ScreenSaver", "/org/freedesktop/ScreenSaver"},
    {"org.gnome.ScreenSaver", "/org/gnome/ScreenSaver"},
}};

}  // namespace

Lock::Lock(sd_bus* session, std::function<void(bool)> changed) : changed_(std::move(changed)) {
  if (session == nullptr) return;
  for (std::size_t index = 0; index < kSavers.size(); ++index) {
    const Name& saver = kSavers[index];
    Saver& state = savers_[index];
    state.lock = this;
    // Some say it at more paths than one.
    state.match = match(session, std::string("interface='") + saver.name + "',member='ActiveChanged'",
                        handler<Saver, &Saver::take>, &state);
    state.call = ask(session, {saver.name, saver.path, saver.name, "GetActive"}, handler<Saver, &Saver::take>,
                     &state, "");
  }
}

int Lock::Saver::take(sd_bus_message* message) {
  int value = 0;
  if (sd_bus_message_read(message, "b", &value) >= 0) lock->set(active, value != 0);
  return 0;
}

void Lock::set(bool& member, bool value) {
  const bool before = locked();
  member = value;
  if (locked() != before) changed_(locked());
}

void Lock::setSessionLocked(bool locked) { set(session_, locked); }

bool Lock::locked() const { return session_ || std::ranges::any_of(savers_, &Saver::active); }

}  // namespace receiver
