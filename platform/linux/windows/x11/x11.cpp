#include "platform/linux/windows/x11/x11.h"

#include <cstdlib>
#include <string>

#include "platform/linux/windows/x11/clients.h"
#include "platform/linux/windows/x11/connection.h"
#include "platform/linux/windows/x11/keys.h"
#include "platform/linux/windows/x11/outputs.h"

namespace linux::windows::x11 {

namespace {

bool isConnected() { return connection() != nullptr; }

std::string obstacle() {
  if (isConnected()) return {};
  const char* const display = std::getenv("DISPLAY");
  if (display == nullptr) return "DISPLAY is not set";
  return std::string("no X server lets us in at ") + display;
}

}  // namespace

const Backend kBackend{
    .name = "X server",
    .obstacle = obstacle,
    .open = isConnected,
    .close = disconnect,
    .takeIn = takeInClients,
    .list = clients,
    .look = look,
    .knowsFront = isConnected,
    .reach = [] { return isConnected() ? Reach::AnyWindow : Reach::Nobody; },
    .activate = activate,
    .sendKey = sendKey,
    .outputs = outputs,
};

}  // namespace linux::windows::x11
