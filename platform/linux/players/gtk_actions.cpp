#include "platform/linux/players/gtk_actions.h"

#include <algorithm>
#include <charconv>
#include <string>
#include <string_view>

#include "platform/linux/system/bus.h"
#include "platform/linux/system/introspection.h"

namespace linux::players {

namespace {

constexpr const char* kInterface = "org.gtk.Actions";
constexpr std::string_view kOfWindow = "win.";
constexpr std::string_view kOfProgram = "app.";

/// Where an action is, and what it is called there.
struct Address {
  system::Callee callee;
  std::string path;
  std::string action;
};

/// The object of the newest window, whose number is the highest; empty when there is none.
std::string newestWindow(const system::Callee& callee, const std::string& path) {
  unsigned newest = 0;
  for (const std::string& child : system::childrenOf(callee, path.substr(0, path.size() - 1).c_str())) {
    unsigned number = 0;
    std::from_chars(child.data(), child.data() + child.size(), number);
    newest = std::max(newest, number);
  }
  return newest != 0 ? path + std::to_string(newest) : std::string();
}

/// Programs write what they like into their windows' properties: only a unique name and a well-formed path
/// are used.
std::optional<Address> addressOf(const windows::Window& window, std::string_view action) {
  const bool ofWindow = action.starts_with(kOfWindow);
  if (!ofWindow && !action.starts_with(kOfProgram)) return std::nullopt;
  Address address;
  address.callee = {window.gtk.busName, window.process};
  address.path = ofWindow ? window.gtk.windowPath : window.gtk.applicationPath;
  address.action = action.substr(kOfWindow.size());
  const std::string& name = address.callee.name;
  if (!name.starts_with(':') || sd_bus_service_name_is_valid(name.c_str()) <= 0) return std::nullopt;
  if (address.path.ends_with('/')) address.path = newestWindow(address.callee, address.path);
  if (sd_bus_object_path_is_valid(address.path.c_str()) <= 0) return std::nullopt;
  return address;
}

std::optional<ActionDescription> describe(const Address& address) {
  const system::Message answer = system::call(address.callee, {address.path.c_str(), kInterface, "Describe"},
                                              system::kQueryLimit, "s", address.action.c_str());
  int enabled = 0;
  int state = 0;
  if (answer == nullptr || sd_bus_message_enter_container(answer.get(), 'r', "bgav") <= 0 ||
      sd_bus_message_read(answer.get(), "b", &enabled) <= 0 || sd_bus_message_skip(answer.get(), "g") < 0) {
    return std::nullopt;
  }
  ActionDescription told{enabled != 0, std::nullopt};
  if (sd_bus_message_enter_container(answer.get(), 'a', "v") > 0 &&
      sd_bus_message_read(answer.get(), "v", "b", &state) > 0) {
    told.state = state != 0;
  }
  return told;
}

bool activate(const Address& address) {
  // No parameter, no word of the platform (a time of the event, a start-up id).
  return system::send(address.callee, {address.path.c_str(), kInterface, "Activate"}, "sava{sv}",
                      address.action.c_str(), 0, 0);
}

bool setState(const Address& address, bool state) {
  return system::send(address.callee, {address.path.c_str(), kInterface, "SetState"}, "sva{sv}",
                      address.action.c_str(), "b", static_cast<int>(state), 0);
}

}  // namespace

bool activateAction(const windows::Window& window, const char* action) {
  const std::string_view text = action;
  const std::size_t sign = text.find('=');
  const auto address = addressOf(window, text.substr(0, sign));
  if (!address) return false;
  // One that is too busy to answer comes to it.
  if (!describe(*address) && !system::timedOutThisTurn(address->callee.process)) return false;
  return sign == std::string_view::npos ? activate(*address)
                                        : setState(*address, text.substr(sign + 1) == "true");
}

std::optional<ActionDescription> describeAction(const windows::Window& window, const char* action) {
  const auto address = addressOf(window, action);
  return address ? describe(*address) : std::nullopt;
}

}  // namespace linux::players
