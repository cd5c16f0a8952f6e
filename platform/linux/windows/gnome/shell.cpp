#include "platform/linux/windows/gnome/shell.h"

#include <sys/types.h>

#include <algorithm>
#include <iterator>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "platform/base/deadline.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/system/bus_values.h"
#include "platform/linux/system/turn.h"
#include "platform/linux/windows/backend.h"
#include "platform/linux/windows/gnome/keyboard.h"
#include "platform/linux/windows/gnome/switch_on.h"

namespace linux::windows::gnome {

namespace {

using system::readBoolean;
using system::readNumber;
using system::readText;

const system::Callee kShell{"org.gnome.Shell", 0};
constexpr const char* kPath = "/com/tarn/kvd/Windows";
constexpr const char* kInterface = "com.tarn.kvd.Windows";

/// Nobody has more open, and no shell more monitors.
constexpr std::size_t kMostWindows = 512;
constexpr std::size_t kMostOutputs = 32;

Shell sShell = Shell::None;
std::vector<Window> sWindows;
std::vector<Output> sOutputs;
/// Shells that have come so far: each numbers its windows anew.
std::uint64_t sShells = 0;
/// The connection that all this is known from.
std::optional<unsigned> sGeneration;
/// The question that is under way, and whether it has been waited for in vain.
system::Slot sAsking;
bool sIsLate = false;

// clang-format off
struct TextField {
  std::string_view key;
  std::string& (*of)(Window& window);
};

constexpr TextField kTexts[] = {
    {"application-id", [](Window& window) -> std::string& { return window.applicationID; }},
    {"class", [](Window& window) -> std::string& { return window.className; }},
    {"instance", [](Window& window) -> std::string& { return window.instanceName; }},
    {"title", [](Window& window) -> std::string& { return window.title; }},
    {"gtk-bus-name", [](Window& window) -> std::string& { return window.gtk.busName; }},
    {"gtk-application-path", [](Window& window) -> std::string& { return window.gtk.applicationPath; }},
    {"gtk-window-path", [](Window& window) -> std::string& { return window.gtk.windowPath; }},
};

struct Flag {
  std::string_view key;
  bool Window::* of;
};

constexpr Flag kFlags[] = {
    {"is-active", &Window::isActive},
    {"is-dialog", &Window::isDialog},
    {"is-full-screen", &Window::isFullScreen},
    {"is-shown", &Window::isShown},
};
// clang-format on

Area readArea(sd_bus_message* message) {
  Area area;
  sd_bus_message_read(message, "(iiii)", &area.x, &area.y, &area.width, &area.height);
  return area;
}

void readProperty(sd_bus_message* message, std::string_view key, std::string_view type, Window& window) {
  const auto hasKey = [&](const auto& row) { return row.key == key; };
  if (key == "id" && type == "u") {
    window.id.number = sShells << 32 | static_cast<std::uint32_t>(readNumber(message, type).value_or(0));
  } else if (key == "process" && type == "i") {
    window.process = static_cast<pid_t>(readNumber(message, type).value_or(0));
  } else if (key == "area" && type == "(iiii)") {
    window.area = readArea(message);
  } else if (const auto* const text = std::ranges::find_if(kTexts, hasKey); text != std::end(kTexts)) {
    text->of(window) = readText(message, type).value_or("");
  } else if (const auto* const flag = std::ranges::find_if(kFlags, hasKey); flag != std::end(kFlags)) {
    window.*flag->of = readBoolean(message, type).value_or(false);
  }
}

std::vector<Window> readWindows(sd_bus_message* message) {
  std::vector<Window> windows;
  if (sd_bus_message_enter_container(message, SD_BUS_TYPE_ARRAY, "a{sv}") <= 0) return windows;
  while (windows.size() < kMostWindows && sd_bus_message_at_end(message, 0) == 0) {
    Window window;
    system::readDictionary(message, [&](std::string_view key, std::string_view type) {
      readProperty(message, key, type, window);
    });
    if (window.id.number != 0) windows.push_back(std::move(window));
  }
  return windows;
}

std::vector<Output> readOutputs(sd_bus_message* message) {
  std::vector<Output> outputs;
  if (sd_bus_message_enter_container(message, SD_BUS_TYPE_ARRAY, "(iiii)") <= 0) return outputs;
  while (outputs.size() < kMostOutputs && sd_bus_message_at_end(message, 0) == 0) {
    outputs.push_back({static_cast<std::uint32_t>(outputs.size() + 1), readArea(message)});
  }
  return outputs;
}

void take(Shell shell, std::vector<Window> windows, std::vector<Output> outputs) {
  sShell = shell;
  sWindows = std::move(windows);
  sOutputs = std::move(outputs);
}

int takeList(sd_bus_message* answer, void*, sd_bus_error*) {
  sAsking.reset();
  if (const sd_bus_error* const error = sd_bus_message_get_error(answer)) {
    const bool isThere = sd_bus_error_has_name(error, SD_BUS_ERROR_SERVICE_UNKNOWN) == 0 &&
                         sd_bus_error_has_name(error, SD_BUS_ERROR_NAME_HAS_NO_OWNER) == 0;
    take(isThere ? Shell::Silent : Shell::None, {}, {});
    return 0;
  }
  if (sd_bus_message_has_signature(answer, "aa{sv}a(iiii)") <= 0) return 0;
  std::vector<Window> windows = readWindows(answer);
  sd_bus_message_exit_container(answer);
  take(Shell::Telling, std::move(windows), readOutputs(answer));
  if (keysAreWanted()) prepareKeyboard();
  return 0;
}

/// A question that is under way already is forgotten: the answer to this one is newer.
void ask() {
  sAsking = system::callLater(system::makeCall(kShell, {kPath, kInterface, "List"}), takeList, nullptr);
  sIsLate = false;
}

int takeChange(sd_bus_message*, void*, sd_bus_error*) {
  ask();
  return 0;
}

void beginAnew() {
  forgetShell();
  sGeneration = system::busGeneration();
  ++sShells;
  ask();
}

int takeOwner(sd_bus_message*, void*, sd_bus_error*) {
  beginAnew();
  return 0;
}

void follow(const std::string& match, sd_bus_message_handler_t take) {
  sd_bus_add_match_async(system::bus(), nullptr, match.c_str(), take, nullptr, nullptr);
}

void followAnew() {
  beginAnew();
  follow(std::string("type='signal',sender='org.freedesktop.DBus',interface='org.freedesktop.DBus',") +
             "member='NameOwnerChanged',arg0='" + kShell.name + "'",
         takeOwner);
  follow("type='signal',sender='" + kShell.name + "',path='" + kPath + "',interface='" + kInterface +
             "',member='Changed'",
         takeChange);
}

void awaitAnswer() {
  const system::Limit limit = system::patience(system::kQueryLimit);
  const base::Deadline deadline(limit);
  while (sAsking != nullptr && !sIsLate) {
    system::takeInBus();
    if (sAsking == nullptr || system::waitForBus(deadline)) continue;
    system::noteWaitInVain(limit);
    sIsLate = true;
  }
}

}  // namespace

Shell takeInShell() {
  if (system::bus() == nullptr) {
    forgetShell();
  } else if (sGeneration != system::busGeneration()) {
    followAnew();
  }
  system::takeInBus();
  awaitAnswer();
  // Who only looks changes nothing.
  if (sShell == Shell::Silent && keysAreWanted()) switchOn();
  return sShell;
}

Shell shell() { return sShell; }

const std::vector<Window>& windowsTold() { return sWindows; }

const std::vector<Output>& outputsTold() { return sOutputs; }

void activateTold(std::uint64_t window) {
  system::send(kShell, {kPath, kInterface, "Activate"}, "u", static_cast<std::uint32_t>(window));
}

void forgetShell() {
  take(Shell::None, {}, {});
  forgetAnswer();
  sGeneration.reset();
  sAsking.reset();
}

}  // namespace linux::windows::gnome
