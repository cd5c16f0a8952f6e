// The session bus, through sd-bus.
//
// The connection is made when it is first needed and made again, at most once a turn of the run loop, after
// it was lost. Signals are taken in by the run loop, and by takeInBus() before a question that
// must see all that has been sent.
#pragma once

#include <systemd/sd-bus.h>

#include <memory>
#include <string>

#include "platform/base/deadline.h"
#include "platform/linux/system/turn.h"

namespace linux::system {

struct MessageReleaser {
  void operator()(sd_bus_message* message) const { sd_bus_message_unref(message); }
};
using Message = std::unique_ptr<sd_bus_message, MessageReleaser>;

struct SlotReleaser {
  void operator()(sd_bus_slot* slot) const { sd_bus_slot_unref(slot); }
};
/// Keeps a handler in place for as long as it lives.
using Slot = std::unique_ptr<sd_bus_slot, SlotReleaser>;

/// The connection; null while there is no session bus. Borrowed.
sd_bus* bus();

/// Sends what is still on its way and closes the connection; a later question makes a new one.
void closeBus();

/// Counts the connections made: whoever keeps something that a connection knew (matches, the names on the
/// bus) begins anew when it changes.
unsigned busGeneration();

/// Handles what has arrived, without waiting; of a flood a part, so that the loop's other sources have their
/// turn before the rest.
void takeInBus();

/// Waits until something has come that takeInBus would handle. False when the deadline has passed first, or
/// there is no connection.
bool waitForBus(const base::Deadline& deadline);

/// Who is called. The process is 0 where a time-out of one call should not silence others.
struct Callee {
  std::string name;
  pid_t process = 0;
};

struct Method {
  const char* path;
  const char* interface;
  const char* member;
};

/// A method call to be filled in; null without a bus or for a malformed address. It does not start its
/// callee.
Message makeCall(const Callee& callee, const Method& method);

/// Sends a call and waits for its answer. Null on an error, on a time-out, and at once when the process has
/// timed out in this turn.
Message call(const Callee& callee, Message request, Limit limit);

/// Sends a call whose answer nobody waits for. False when it could not be queued.
bool send(Message request);

/// Sends a call whose answer, or error, takeInBus hands to `take` with this context, unless the slot has been
/// released by then. Null when it could not be queued.
Slot callLater(Message request, sd_bus_message_handler_t take, void* context);

/// Calls with arguments as sd_bus_message_append takes them; types is their signature, "" for none.
template <typename... Arguments>
Message call(const Callee& callee, const Method& method, Limit limit, const char* types,
             Arguments... arguments) {
  Message request = makeCall(callee, method);
  if (request == nullptr || sd_bus_message_append(request.get(), types, arguments...) < 0) return nullptr;
  return call(callee, std::move(request), limit);
}

/// As call, without waiting for an answer.
template <typename... Arguments>
bool send(const Callee& callee, const Method& method, const char* types, Arguments... arguments) {
  Message request = makeCall(callee, method);
  if (request == nullptr || sd_bus_message_append(request.get(), types, arguments...) < 0) return false;
  return send(std::move(request));
}

/// Whether somebody owns the name now.
bool nameHasOwner(const char* name);

}  // namespace linux::system
