#include "platform/linux/windows/x11/x11.h"

#include "platform/linux/windows/x11/clients.h"
#include "platform/linux/windows/x11/connection.h"
#include "platform/linux/windows/x11/keys.h"
#include "platform/linux/windows/x11/outputs.h"

namespace linux::windows::x11 {

namespace {

bool isConnected() { return connection() != nullptr; }

}  // namespace

const Backend kBackend{
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
