// What the receiver asks of a bus, through sd-bus. Nothing here waits for an answer, and nothing starts the
// program that is asked.
#pragma once

#include <string>

#include "receiver/handles.h"

namespace receiver {

/// Joins the bus that `open` (sd_bus_open_user or sd_bus_open_system) gives, and puts it on the loop; null
/// where there is none.
Bus joinBus(sd_event* loop, int (*open)(sd_bus**));

/// A handler of messages that is a member function of the owner that is given with it.
template <typename Owner, int (Owner::*handle)(sd_bus_message*)>
int handler(sd_bus_message* message, void* owner, sd_bus_error* /*error*/) {
  return (static_cast<Owner*>(owner)->*handle)(message);
}

/// Hands the signals of a match rule to a handler, for as long as the slot lives.
Slot match(sd_bus* bus, const std::string& rule, sd_bus_message_handler_t handle, void* owner);

/// Whom to call.
struct Method {
  const char* name;
  std::string path;
  const char* interface;
  const char* member;
};

/// A call to be filled in; null for a malformed address.
Message makeCall(sd_bus* bus, const Method& method);

/// Sends a call; the handler gets its answer, or error, if the slot still lives then.
Slot send(const Message& call, sd_bus_message_handler_t handle, void* owner);

/// Calls with arguments as sd_bus_message_append takes them; types is their signature, "" for none.
template <typename... Arguments>
Slot ask(sd_bus* bus, const Method& method, sd_bus_message_handler_t handle, void* owner, const char* types,
         Arguments... arguments) {
  const Message call = makeCall(bus, method);
  if (call == nullptr || sd_bus_message_append(call.get(), types, arguments...) < 0) return nullptr;
  return send(call, handle, owner);
}

}  // namespace receiver
