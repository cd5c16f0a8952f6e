#include "platform/linux/windows/gnome/keyboard.h"

#include <limits>
#include <optional>
#include <string>
#include <utility>

#include "platform/base/deadline.h"
#include "platform/host.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/system/bus_values.h"
#include "platform/linux/system/turn.h"

namespace linux::windows::gnome {

namespace {

const system::Callee kDesktop{"org.gnome.Mutter.RemoteDesktop", 0};
constexpr const char* kPath = "/org/gnome/Mutter/RemoteDesktop";
constexpr const char* kInterface = "org.gnome.Mutter.RemoteDesktop";
constexpr const char* kSessionInterface = "org.gnome.Mutter.RemoteDesktop.Session";

/// How long a session stays open after a key, in seconds.
constexpr double kUnused = 180;
constexpr double kNever = std::numeric_limits<double>::infinity();

struct HeldWith {
  Modifier modifier;
  std::uint32_t keysym;
};

// clang-format off
constexpr HeldWith kModifiers[] = {
    {kShift, 0xFFE1},
    {kControl, 0xFFE3},
    {kAlt, 0xFFE9},
};
// clang-format on

/// Where the session is, empty without one; it can be used once it is open.
std::string sSession;
bool sIsOpen = false;
/// One has been opened ahead of the first key since the shell is there.
bool sIsPrepared = false;
/// The answer that opening waits for.
system::Slot sOpening;
HostTimerRef sUnused;
/// The connection that all this is known from.
std::optional<unsigned> sGeneration;

void forgetSession() {
  sSession.clear();
  sIsOpen = false;
  sOpening.reset();
  if (!sUnused) return;
  HostInvalidateTimer(sUnused);
  HostRelease(sUnused);
  sUnused = nullptr;
}

bool tell(const char* member) {
  return system::send(kDesktop, {sSession.c_str(), kSessionInterface, member}, "");
}

void closeUnused(HostTimerRef, void*) { dropKeyboard(); }

/// Has the session closed when it stays unused from here on.
void startTimer() {
  if (sUnused) {
    HostInvalidateTimer(sUnused);
    HostRelease(sUnused);
  }
  sUnused = HostCreateRepeatingTimer(HostAbsoluteTime() + kUnused, kNever, closeUnused, nullptr);
  if (sUnused) HostRunLoopAddTimer(HostRunLoopCurrent(), sUnused, HostRunLoopMode::Default);
}

int takeStarted(sd_bus_message* answer, void*, sd_bus_error*) {
  sOpening.reset();
  if (sd_bus_message_is_method_error(answer, nullptr) != 0) {
    forgetSession();
    return 0;
  }
  sIsOpen = true;
  startTimer();
  return 0;
}

int takeSession(sd_bus_message* answer, void*, sd_bus_error*) {
  sOpening.reset();
  sSession = system::readText(answer, "o").value_or("");
  if (sSession.empty()) return 0;
  sOpening = system::callLater(system::makeCall(kDesktop, {sSession.c_str(), kSessionInterface, "Start"}),
                               takeStarted, nullptr);
  return 0;
}

int takeClosed(sd_bus_message* signal, void*, sd_bus_error*) {
  if (sSession == sd_bus_message_get_path(signal)) forgetSession();
  return 0;
}

int takeOwner(sd_bus_message*, void*, sd_bus_error*) {
  forgetSession();
  sIsPrepared = false;
  return 0;
}

void follow(const std::string& match, sd_bus_message_handler_t take) {
  sd_bus_add_match_async(system::bus(), nullptr, match.c_str(), take, nullptr, nullptr);
}

void beginAnew() {
  forgetSession();
  sIsPrepared = false;
  sGeneration = system::busGeneration();
  follow(std::string("type='signal',interface='") + kSessionInterface + "',member='Closed'", takeClosed);
  follow(std::string("type='signal',sender='org.freedesktop.DBus',interface='org.freedesktop.DBus',") +
             "member='NameOwnerChanged',arg0='" + kDesktop.name + "'",
         takeOwner);
}

void beginToOpen() {
  if (sIsOpen || sOpening != nullptr) return;
  sOpening = system::callLater(system::makeCall(kDesktop, {kPath, kInterface, "CreateSession"}), takeSession,
                               nullptr);
}

void awaitOpening() {
  const system::Limit limit = system::patience(system::kQueryLimit);
  const base::Deadline deadline(limit);
  while (sOpening != nullptr) {
    system::takeInBus();
    if (sOpening == nullptr || system::waitForBus(deadline)) continue;
    return system::noteWaitInVain(limit);
  }
}

bool send(std::uint32_t keysym, bool down) {
  return system::send(kDesktop, {sSession.c_str(), kSessionInterface, "NotifyKeyboardKeysym"}, "ub", keysym,
                      static_cast<int>(down));
}

}  // namespace

void prepareKeyboard() {
  if (system::bus() == nullptr) return;
  if (sGeneration != system::busGeneration()) beginAnew();
  if (!std::exchange(sIsPrepared, true)) beginToOpen();
}

bool tapKey(std::uint32_t keysym, bool down, Modifiers modifiers) {
  // A session that has been closed has released its keys.
  if (!down && !sIsOpen) return false;
  prepareKeyboard();
  beginToOpen();
  awaitOpening();
  if (!sIsOpen) return false;
  startTimer();
  if (!down && !send(keysym, false)) return false;
  for (const HeldWith& held : kModifiers) {
    if ((modifiers & held.modifier) != 0) send(held.keysym, down);
  }
  return !down || send(keysym, true);
}

void dropKeyboard() {
  if (sIsOpen) tell("Stop");
  forgetSession();
}

}  // namespace linux::windows::gnome
