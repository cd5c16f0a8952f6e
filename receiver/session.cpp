#include "receiver/session.h"

#include <unistd.h>

#include <optional>
#include <string_view>
#include <utility>

#include "receiver/bus.h"

namespace receiver {
namespace {

constexpr char kName[] = "org.freedesktop.login1";
constexpr char kManagerPath[] = "/org/freedesktop/login1";
constexpr char kManager[] = "org.freedesktop.login1.Manager";
constexpr char kUser[] = "org.freedesktop.login1.User";
constexpr char kSession[] = "org.freedesktop.login1.Session";
constexpr char kProperties[] = "org.freedesktop.DBus.Properties";

std::string rule(const std::string& path, const char* interface, const char* member) {
  return std::string("sender='") + kName + "',path='" + path + "',interface='" + interface + "',member='" +
         member + "'";
}

/// The object path in the struct (so) of a variant; empty where it is another one or names nothing.
std::string objectIn(sd_bus_message* message) {
  const char* id = nullptr;
  const char* path = nullptr;
  if (sd_bus_message_read(message, "v", "(so)", &id, &path) < 0 || std::string_view(id).empty()) return {};
  return path;
}

std::optional<bool> boolIn(sd_bus_message* message) {
  int value = 0;
  if (sd_bus_message_read(message, "v", "b", &value) < 0) return std::nullopt;
  return value != 0;
}

struct State {
  bool hasSeat = false;
  bool active = false;
  bool locked = false;
};

/// What GetAll of a session answered; nothing for rubbish.
std::optional<State> stateIn(sd_bus_message* message) {
  State state;
  if (sd_bus_message_enter_container(message, 'a', "{sv}") < 0) return std::nullopt;
  while (sd_bus_message_enter_container(message, 'e', "sv") > 0) {
    const char* name = nullptr;
    if (sd_bus_message_read_basic(message, 's', &name) < 0) return std::nullopt;
    const std::string_view property = name;
    if (property == "Seat") {
      state.hasSeat = !objectIn(message).empty();
    } else if (property == "Active") {
      state.active = boolIn(message).value_or(false);
    } else if (property == "LockedHint") {
      state.locked = boolIn(message).value_or(false);
    } else if (sd_bus_message_skip(message, "v") < 0) {
      return std::nullopt;
    }
    if (sd_bus_message_exit_container(message) < 0) return std::nullopt;
  }
  return state;
}

}  // namespace

Session::Session(sd_bus* system, Listener listener) : bus_(system), listener_(std::move(listener)) {
  if (bus_ == nullptr) {
    listener_.active(true);
    return;
  }
  ownerMatch_ =
      match(bus_, "sender='org.freedesktop.DBus',member='NameOwnerChanged',arg0='org.freedesktop.login1'",
            handler<Session, &Session::takeOwner>, this);
  loginMatch_ =
      match(bus_, rule(kManagerPath, kManager, "UserNew"), handler<Session, &Session::askForUser>, this);
  sleepMatch_ = match(bus_, rule(kManagerPath, kManager, "PrepareForSleep"),
                      handler<Session, &Session::takeSleep>, this);
  askForUser(nullptr);
}

int Session::takeOwner(sd_bus_message* signal) {
  const char* owner = nullptr;
  if (sd_bus_message_read(signal, "sss", nullptr, nullptr, &owner) < 0) return 0;
  // Until one that is started anew has come up, what the last one said stands.
  return std::string_view(owner).empty() ? 0 : askForUser(nullptr);
}

int Session::askForUser(sd_bus_message* /*cause*/) {
  userCall_ = ask(bus_, {kName, kManagerPath, kManager, "GetUser"}, handler<Session, &Session::takeUser>,
                  this, "u", geteuid());
  return 0;
}

int Session::takeUser(sd_bus_message* answer) {
  user_.clear();
  session_.clear();
  const char* path = nullptr;
  if (sd_bus_message_read(answer, "o", &path) >= 0) {
    // Whoever loses the bus after this knows nothing of the session any more, and is to be started again.
    sd_bus_set_exit_on_disconnect(bus_, 1);
    user_ = path;
    userMatch_ = match(bus_, rule(user_, kProperties, "PropertiesChanged"),
                       handler<Session, &Session::askForDisplay>, this);
    return askForDisplay(nullptr);
  }
  // logind itself answers that it does not know the user: then nobody is logged in.
  const sd_bus_error* const error = sd_bus_message_get_error(answer);
  listener_.active(error == nullptr || !std::string_view(error->name).starts_with(kName));
  return 0;
}

int Session::askForDisplay(sd_bus_message* /*cause*/) {
  displayCall_ = ask(bus_, {kName, user_, kProperties, "Get"}, handler<Session, &Session::takeDisplay>, this,
                     "ss", kUser, "Display");
  return 0;
}

int Session::takeDisplay(sd_bus_message* answer) {
  const std::string session = objectIn(answer);
  if (session.empty()) {
    session_.clear();
    listener_.active(false);
    return 0;
  }
  if (session != session_) {
    session_ = session;
    stateMatch_ = match(bus_, rule(session_, kProperties, "PropertiesChanged"),
                        handler<Session, &Session::askForState>, this);
    lockMatch_ = match(bus_, rule(session_, kSession, "Lock"), handler<Session, &Session::takeLock>, this);
    unlockMatch_ =
        match(bus_, rule(session_, kSession, "Unlock"), handler<Session, &Session::takeUnlock>, this);
  }
  return askForState(nullptr);
}

int Session::askForState(sd_bus_message* /*cause*/) {
  stateCall_ = ask(bus_, {kName, session_, kProperties, "GetAll"}, handler<Session, &Session::takeState>,
                   this, "s", kSession);
  return 0;
}

int Session::takeState(sd_bus_message* answer) {
  const State state = stateIn(answer).value_or(State{});
  if (state.locked != hint_) {
    hint_ = state.locked;
    listener_.locked(hint_);
  }
  listener_.active(state.hasSeat && state.active);
  return 0;
}

int Session::takeLock(sd_bus_message* /*signal*/) {
  listener_.locked(true);
  return 0;
}

int Session::takeUnlock(sd_bus_message* /*signal*/) {
  listener_.locked(false);
  return 0;
}

int Session::takeSleep(sd_bus_message* signal) {
  int before = 0;
  if (sd_bus_message_read(signal, "b", &before) >= 0 && before != 0) listener_.sleeps();
  return 0;
}

}  // namespace receiver
