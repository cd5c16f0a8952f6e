#include "platform/linux/windows/session.h"

#include <cstdint>
#include <cstdlib>
#include <string_view>
#include <vector>

#include "platform/base/run_loop.h"
#include "platform/linux/system/bus.h"

namespace linux::windows {

namespace {

constexpr std::string_view kVariables[] = {"DISPLAY", "XAUTHORITY", "WAYLAND_DISPLAY", "SWAYSOCK",
                                           "HYPRLAND_INSTANCE_SIGNATURE"};

/// The turn in which the service manager was last asked, and whether it told anything new.
std::optional<std::uint64_t> sAsked;
bool sChanged = false;

/// True when the assignment is one of interest and says something new.
bool take(std::string_view assignment) {
  const std::size_t sign = assignment.find('=');
  if (sign == std::string_view::npos) return false;
  const std::string name(assignment.substr(0, sign));
  const std::string value(assignment.substr(sign + 1));
  for (const std::string_view variable : kVariables) {
    if (name != variable) continue;
    const char* const present = std::getenv(name.c_str());
    return (present == nullptr || value != present) && setenv(name.c_str(), value.c_str(), 1) == 0;
  }
  return false;
}

}  // namespace

std::optional<std::vector<std::string>> serviceManagerEnvironment() {
  const system::Message answer =
      system::call({"org.freedesktop.systemd1", 0},
                   {"/org/freedesktop/systemd1", "org.freedesktop.DBus.Properties", "Get"},
                   system::kQueryLimit, "ss", "org.freedesktop.systemd1.Manager", "Environment");
  if (answer == nullptr || sd_bus_message_enter_container(answer.get(), 'v', "as") <= 0 ||
      sd_bus_message_enter_container(answer.get(), 'a', "s") <= 0) {
    return std::nullopt;
  }
  std::vector<std::string> environment;
  const char* assignment = nullptr;
  while (sd_bus_message_read(answer.get(), "s", &assignment) > 0) environment.emplace_back(assignment);
  return environment;
}

bool takeSessionEnvironment() {
  if (sAsked == base::turn()) return sChanged;
  sAsked = base::turn();
  sChanged = false;
  const auto environment = serviceManagerEnvironment();
  if (!environment) return false;
  for (const std::string& assignment : *environment) sChanged |= take(assignment);
  return sChanged;
}

}  // namespace linux::windows
