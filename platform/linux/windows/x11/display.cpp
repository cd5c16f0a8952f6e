#include "platform/linux/windows/x11/display.h"

#include <cstdlib>
#include <string>
#include <string_view>

#include "platform/linux/system/bus.h"

namespace linux::windows::x11 {
namespace {

constexpr std::string_view kVariables[] = {"DISPLAY", "XAUTHORITY"};

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

bool takeDisplayOfSession() {
  const system::Message answer =
      system::call({"org.freedesktop.systemd1", 0},
                   {"/org/freedesktop/systemd1", "org.freedesktop.DBus.Properties", "Get"},
                   system::kQueryLimit, "ss", "org.freedesktop.systemd1.Manager", "Environment");
  if (answer == nullptr || sd_bus_message_enter_container(answer.get(), 'v', "as") <= 0 ||
      sd_bus_message_enter_container(answer.get(), 'a', "s") <= 0) {
    return false;
  }
  bool changed = false;
  const char* assignment = nullptr;
  while (sd_bus_message_read(answer.get(), "s", &assignment) > 0) changed |= take(assignment);
  return changed;
}

}  // namespace linux::windows::x11
