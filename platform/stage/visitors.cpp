#include "platform/stage/visitors.h"

#include <unistd.h>

#include <algorithm>
#include <cstring>
#include <optional>
#include <string>

#include "messages/kvd_messages.h"
#include "platform/base/port.h"
#include "platform/stage/director.h"
#include "remote/buttons.h"

namespace stage {

namespace {

template <typename Request>
std::optional<Request> requestIn(std::span<const std::byte> message) {
  Request request;
  if (message.size() != sizeof request) return std::nullopt;
  std::memcpy(&request, message.data(), sizeof request);
  return request;
}

std::string commandOf(const kvd_handlehidevent_request_t& event) {
  const auto all = remote::buttons();
  const auto button = std::ranges::find_if(all, [&](const remote::Button& known) {
    return known.usagePage == event.usagePage && known.usage == event.usage;
  });
  if (button != all.end() && event.extra == 0 && event.value == remote::kPressed) {
    return "press " + std::string(button->name);
  }
  if (button != all.end() && event.extra == 0 && event.value == remote::kReleased) {
    return "release " + std::string(button->name);
  }
  return "raw " + std::to_string(event.usagePage) + " " + std::to_string(event.usage) + " " +
         std::to_string(event.value) + " " + std::to_string(event.extra);
}

/// The command that sends such a message; nothing for one that no command sends.
std::optional<std::string> commandFor(std::span<const std::byte> message) {
  const auto header = requestIn<mach_msg_header_t>(message.first(sizeof(mach_msg_header_t)));
  if (header->msgh_id == kKVDTerminateID && message.size() == sizeof(kvd_terminate_request_t)) return "quit";
  if (header->msgh_id == kKVDSetScreenLockedID) {
    const auto request = requestIn<kvd_setscreenlocked_request_t>(message);
    if (request) return request->locked != 0 ? "lock on" : "lock off";
  }
  if (header->msgh_id == kKVDHandleHIDEventID) {
    const auto request = requestIn<kvd_handlehidevent_request_t>(message);
    if (request && request->NDR.int_rep == NDR_record.int_rep) return commandOf(*request);
  }
  return std::nullopt;
}

}  // namespace

void watchVisitors() {
  base::setMessageObserver([](std::span<const std::byte> message, pid_t sender) {
    if (sender == getpid()) return;
    const auto command = commandFor(message);
    if (!command) return;
    say("another program: " + *command);
    keep(*command);
  });
}

void ignoreVisitors() { base::setMessageObserver(nullptr); }

}  // namespace stage
