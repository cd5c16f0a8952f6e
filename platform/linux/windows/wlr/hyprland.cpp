#include "platform/linux/windows/wlr/hyprland.h"

#include <cstdint>
#include <cstdlib>
#include <map>
#include <nlohmann/json.hpp>
#include <string>
#include <utility>

#include "platform/linux/windows/wlr/ipc.h"

namespace linux::windows::wlr {

namespace {

using Json = nlohmann::json;

/// It has a socket for each question, and ends its answer by closing it. Nothing when there is none, or it is
/// too long.
std::string answerTo(std::string_view question, pid_t compositor, const base::Deadline& deadline) {
  const char* const directory = std::getenv("XDG_RUNTIME_DIR");
  const char* const instance = std::getenv("HYPRLAND_INSTANCE_SIGNATURE");
  if (directory == nullptr || instance == nullptr) return {};
  const auto socket = connectTo(std::string(directory) + "/hypr/" + instance + "/.socket.sock", compositor);
  std::string answer;
  if (!socket || !ask(socket, question) || readUpTo(kLongestAnswer, socket, deadline, answer)) return {};
  return answer;
}

std::int64_t idIn(const Json& object, const char* member) {
  const auto found = object.find(member);
  return found != object.end() && found->is_object() ? valueIn<std::int64_t>(*found, "id") : 0;
}

struct Monitor {
  std::string name;
  /// 0 for none.
  std::int64_t workspace = 0;
  /// One that lies above it.
  std::int64_t special = 0;
};

std::map<std::int64_t, Monitor> monitorsIn(std::string_view text) {
  std::map<std::int64_t, Monitor> found;
  for (const Json& each : Json::parse(text, nullptr, false)) {
    if (!each.is_object()) continue;
    found[valueIn<std::int64_t>(each, "id")] = {
        valueIn<std::string>(each, "name"), idIn(each, "activeWorkspace"), idIn(each, "specialWorkspace")};
  }
  return found;
}

}  // namespace

std::vector<Container> askHyprland(pid_t compositor, const base::Deadline& deadline) {
  const std::string clients = answerTo("j/clients", compositor, deadline);
  if (clients.empty()) return {};
  return hyprlandWindowsIn(clients, answerTo("j/monitors", compositor, deadline));
}

std::vector<Container> hyprlandWindowsIn(std::string_view clients, std::string_view monitors) {
  std::vector<Container> found;
  const auto known = monitorsIn(monitors);
  for (const Json& client : Json::parse(clients, nullptr, false)) {
    if (!client.is_object() || !valueIn<bool>(client, "mapped")) continue;
    Container window;
    // Its address, in hexadecimal.
    window.id = static_cast<std::int64_t>(
        std::strtoull(valueIn<std::string>(client, "address").c_str(), nullptr, 16));
    window.process = static_cast<pid_t>(valueIn<std::int64_t>(client, "pid"));
    window.applicationID = valueIn<std::string>(client, "class");
    window.title = valueIn<std::string>(client, "title");
    const auto monitor = known.find(valueIn<std::int64_t>(client, "monitor"));
    if (monitor != known.end()) {
      const std::int64_t workspace = idIn(client, "workspace");
      window.output = monitor->second.name;
      window.isVisible = workspace != 0 && !valueIn<bool>(client, "hidden") &&
                         (workspace == monitor->second.workspace || workspace == monitor->second.special);
    }
    if (window.id != 0) found.push_back(std::move(window));
  }
  return found;
}

}  // namespace linux::windows::wlr
