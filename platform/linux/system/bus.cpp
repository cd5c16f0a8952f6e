#include "platform/linux/system/bus.h"

#include <cerrno>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <optional>

#include "platform/base/failure.h"
#include "platform/base/run_loop.h"
#include "platform/linux/system/bus_loop.h"

namespace linux::system {

namespace {

const Callee kBusItself{"org.freedesktop.DBus", 0};

sd_bus* sBus = nullptr;
base::Owned<base::Source> sSource;
unsigned sGeneration = 0;
/// The turn in which a connection was last tried.
std::optional<std::uint64_t> sTried;

void loseConnection() {
  takeOffLoop(sSource);
  sBus = sd_bus_close_unref(sBus);
}

/// Waits until the bus has let us in; sd-bus itself would wait for ever.
bool becomesReady(sd_bus* connection) {
  const base::Deadline deadline(kCommandLimit);
  while (sd_bus_is_ready(connection) == 0) {
    const int done = sd_bus_process(connection, nullptr);
    if (done < 0) return false;
    if (done > 0) continue;
    if (!waitForArrival(connection, deadline)) return false;
  }
  return sd_bus_is_ready(connection) > 0;
}

void noteNoBus(const char* why) {
  const char* const address = std::getenv("DBUS_SESSION_BUS_ADDRESS");
  base::noteFailure(std::string("no session bus at ") +
                    (address != nullptr ? address : "$XDG_RUNTIME_DIR/bus") + ": " + why +
                    "; start kvd in your session, or set DBUS_SESSION_BUS_ADDRESS");
}

void connect() {
  sd_bus* connection = nullptr;
  const int opened = sd_bus_open_user(&connection);
  if (opened == -ENOMEDIUM) return noteNoBus("XDG_RUNTIME_DIR is not set");
  if (opened < 0) return noteNoBus(std::strerror(-opened));
  if (!becomesReady(connection)) {
    sd_bus_close_unref(connection);
    return noteNoBus("it does not let us in");
  }
  sBus = connection;
  ++sGeneration;
  sSource = putOnLoop(connection, takeInBus);
}

}  // namespace

sd_bus* bus() {
  if (sBus != nullptr && sd_bus_is_open(sBus) <= 0) loseConnection();
  if (sBus == nullptr && sTried != base::turn()) {
    sTried = base::turn();
    connect();
  }
  return sBus;
}

void closeBus() {
  if (sBus != nullptr) sd_bus_flush(sBus);
  loseConnection();
}

unsigned busGeneration() { return sGeneration; }

void takeInBus() {
  if (sBus != nullptr && !handleArrived(sBus)) loseConnection();
}

bool waitForBus(const base::Deadline& deadline) { return sBus != nullptr && waitForArrival(sBus, deadline); }

Message makeCall(const Callee& callee, const Method& method) {
  sd_bus* const connection = bus();
  sd_bus_message* request = nullptr;
  if (connection == nullptr ||
      sd_bus_message_new_method_call(connection, &request, callee.name.c_str(), method.path, method.interface,
                                     method.member) < 0) {
    return nullptr;
  }
  sd_bus_message_set_auto_start(request, 0);
  return Message(request);
}

Message call(const Callee& callee, Message request, Limit limit) {
  if (request == nullptr || timedOutThisTurn(callee.process)) return nullptr;
  limit = patience(limit);
  sd_bus_message* answer = nullptr;
  sd_bus_error error = {};
  const int result = sd_bus_call(sd_bus_message_get_bus(request.get()), request.get(),
                                 static_cast<std::uint64_t>(limit.count()), &error, &answer);
  // The bus says NoReply when the callee has died, which has the same number.
  if (result == -ETIMEDOUT && sd_bus_error_has_name(&error, SD_BUS_ERROR_NO_REPLY) == 0) {
    noteWaitInVain(limit);
    noteTimeout(callee.process);
  }
  sd_bus_error_free(&error);
  return Message(result < 0 ? nullptr : answer);
}

bool send(Message request) {
  if (request == nullptr) return false;
  sd_bus_message_set_expect_reply(request.get(), 0);
  return sd_bus_send(nullptr, request.get(), nullptr) >= 0;
}

Slot callLater(Message request, sd_bus_message_handler_t take, void* context) {
  sd_bus_slot* slot = nullptr;
  if (request == nullptr || sd_bus_call_async(sd_bus_message_get_bus(request.get()), &slot, request.get(),
                                              take, context, UINT64_MAX) < 0) {
    return nullptr;
  }
  return Slot(slot);
}

bool nameHasOwner(const char* name) {
  const Message answer = call(kBusItself, {"/org/freedesktop/DBus", "org.freedesktop.DBus", "NameHasOwner"},
                              kQueryLimit, "s", name);
  int owned = 0;
  return answer != nullptr && sd_bus_message_read(answer.get(), "b", &owned) > 0 && owned != 0;
}

}  // namespace linux::system
