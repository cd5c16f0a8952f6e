#include "receiver/bus.h"

namespace receiver {

Bus joinBus(sd_event* loop, int (*open)(sd_bus**)) {
  sd_bus* made = nullptr;
  if (open(&made) < 0) return nullptr;
  Bus bus(made);
  if (sd_bus_attach_event(made, loop, SD_EVENT_PRIORITY_NORMAL) < 0) return nullptr;
  return bus;
}

Slot match(sd_bus* bus, const std::string& rule, sd_bus_message_handler_t handle, void* owner) {
  sd_bus_slot* slot = nullptr;
  sd_bus_add_match_async(bus, &slot, ("type='signal'," + rule).c_str(), handle, nullptr, owner);
  return Slot(slot);
}

Message makeCall(sd_bus* bus, const Method& method) {
  sd_bus_message* call = nullptr;
  if (sd_bus_message_new_method_call(bus, &call, method.name, method.path.c_str(), method.interface,
                                     method.member) < 0) {
    return nullptr;
  }
  sd_bus_message_set_auto_start(call, 0);
  return Message(call);
}

Slot send(const Message& call, sd_bus_message_handler_t handle, void* owner) {
  sd_bus_slot* slot = nullptr;
  sd_bus_call_async(sd_bus_message_get_bus(call.get()), &slot, call.get(), handle, owner, 0);
  return Slot(slot);
}

}  // namespace receiver
