#include "platform/linux/windows/gnome/accessibility.h"

#include <systemd/sd-bus.h>

#include <algorithm>
#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "platform/base/deadline.h"
#include "platform/base/run_loop.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/system/bus_loop.h"
#include "platform/linux/system/bus_values.h"
#include "platform/linux/system/process.h"
#include "platform/linux/system/turn.h"

namespace linux::windows::gnome {

namespace {

using system::Slot;

constexpr const char* kRegistry = "org.a11y.atspi.Registry";
constexpr const char* kRoot = "/org/a11y/atspi/accessible/root";
constexpr const char* kAccessible = "org.a11y.atspi.Accessible";
constexpr const char* kBusItself = "org.freedesktop.DBus";

/// Of an active window, in the first word of its states.
constexpr std::uint32_t kActive = 1U << 1;

/// Nobody has more open.
constexpr std::size_t kMostPrograms = 256;
constexpr std::size_t kMostFrames = 64;

/// A window, as a program tells of it.
struct Frame {
  bool isActive = false;
  Slot asking;
};

struct Program {
  std::uint64_t number = 0;
  pid_t process = 0;
  /// By their paths.
  std::map<std::string, Frame> frames;
  Slot asking;
  Slot findingProcess;
};

sd_bus* sBus = nullptr;
base::Owned<base::Source> sSource;
/// By their names on the bus.
std::map<std::string, Program> sPrograms;
std::uint64_t sLastNumber = 0;
/// The question where the bus is, then who is on it; and the turn in which that was last begun.
Slot sAsking;
std::optional<std::uint64_t> sTried;
/// Answers have been waited for in vain.
bool sIsLate = false;

void lose() {
  system::takeOffLoop(sSource);
  sAsking.reset();
  sPrograms.clear();
  sBus = sd_bus_close_unref(sBus);
}

void handle() {
  if (sBus != nullptr && !system::handleArrived(sBus)) lose();
}

struct Address {
  const char* callee;
  const char* path;
  const char* interface;
  const char* member;
};

template <typename... Arguments>
Slot ask(const Address& address, sd_bus_message_handler_t take, void* context, const char* types,
         Arguments... arguments) {
  sd_bus_slot* slot = nullptr;
  sd_bus_call_method_async(sBus, &slot, address.callee, address.path, address.interface, address.member, take,
                           context, types, arguments...);
  return Slot(slot);
}

/// Calls take(name, path) for each object that an answer tells of.
template <typename Take>
void readObjects(sd_bus_message* answer, Take take) {
  if (sd_bus_message_enter_container(answer, SD_BUS_TYPE_ARRAY, "(so)") <= 0) return;
  const char* name = nullptr;
  const char* path = nullptr;
  while (sd_bus_message_read(answer, "(so)", &name, &path) > 0) take(name, path);
}

int takeState(sd_bus_message* answer, void* context, sd_bus_error*) {
  Frame& frame = *static_cast<Frame*>(context);
  frame.asking.reset();
  std::uint32_t states = 0;
  if (sd_bus_message_enter_container(answer, SD_BUS_TYPE_ARRAY, "u") > 0) {
    sd_bus_message_read(answer, "u", &states);
  }
  frame.isActive = (states & kActive) != 0;
  return 0;
}

int takeFrames(sd_bus_message* answer, void* context, sd_bus_error*) {
  Program& program = *static_cast<Program*>(context);
  program.asking.reset();
  readObjects(answer, [&](const char* name, const char* path) {
    // What a program says by itself meanwhile is newer.
    if (program.frames.size() >= kMostFrames || program.frames.contains(path)) return;
    Frame& frame = program.frames[path];
    frame.asking = ask({name, path, kAccessible, "GetState"}, takeState, &frame, "");
  });
  return 0;
}

int takeProcess(sd_bus_message* answer, void* context, sd_bus_error*) {
  Program& program = *static_cast<Program*>(context);
  program.findingProcess.reset();
  std::uint32_t process = 0;
  sd_bus_message_read(answer, "u", &process);
  program.process = static_cast<pid_t>(process);
  return 0;
}

/// Null where there are too many.
Program* programNamed(const char* name) {
  const auto known = sPrograms.find(name);
  if (known != sPrograms.end()) return &known->second;
  if (sPrograms.size() >= kMostPrograms) return nullptr;
  Program& program = sPrograms[name];
  program.number = ++sLastNumber;
  program.findingProcess =
      ask({kBusItself, "/org/freedesktop/DBus", kBusItself, "GetConnectionUnixProcessID"}, takeProcess,
          &program, "s", name);
  return &program;
}

int takePrograms(sd_bus_message* answer, void*, sd_bus_error*) {
  sAsking.reset();
  readObjects(answer, [](const char* name, const char* path) {
    if (Program* const program = programNamed(name)) {
      program->asking = ask({name, path, kAccessible, "GetChildren"}, takeFrames, program, "");
    }
  });
  return 0;
}

int takeActivity(sd_bus_message* signal, void*, sd_bus_error*) {
  const char* state = nullptr;
  int isActive = 0;
  const char* const sender = sd_bus_message_get_sender(signal);
  if (sender == nullptr || sd_bus_message_read(signal, "si", &state, &isActive) <= 0) return 0;
  Program* const program = programNamed(sender);
  if (program == nullptr) return 0;
  const char* const path = sd_bus_message_get_path(signal);
  if (isActive == 0) {
    program->frames.erase(path);
  } else if (program->frames.size() < kMostFrames) {
    program->frames.insert_or_assign(path, Frame{true, nullptr});
  }
  return 0;
}

int takeOwner(sd_bus_message* signal, void*, sd_bus_error*) {
  const char* name = nullptr;
  const char* before = nullptr;
  const char* after = nullptr;
  if (sd_bus_message_read(signal, "sss", &name, &before, &after) > 0 && *after == '\0') sPrograms.erase(name);
  return 0;
}

void follow(const char* match, sd_bus_message_handler_t take) {
  sd_bus_add_match_async(sBus, nullptr, match, take, nullptr, nullptr);
}

bool connect(const std::string& address) {
  // Other kinds of addresses would have sd-bus start a program.
  if (!address.starts_with("unix:") || address.find(';') != std::string::npos) return false;
  return sd_bus_new(&sBus) >= 0 && sd_bus_set_address(sBus, address.c_str()) >= 0 &&
         sd_bus_set_bus_client(sBus, 1) >= 0 && sd_bus_start(sBus) >= 0;
}

int takeAddress(sd_bus_message* answer, void*, sd_bus_error*) {
  sAsking.reset();
  if (!connect(system::readText(answer, "s").value_or(""))) {
    lose();
    return 0;
  }
  sSource = system::putOnLoop(sBus, handle);
  follow("type='signal',interface='org.a11y.atspi.Event.Object',member='StateChanged',arg0='active'",
         takeActivity);
  follow(
      "type='signal',sender='org.freedesktop.DBus',interface='org.freedesktop.DBus',"
      "member='NameOwnerChanged'",
      takeOwner);
  // Programs tell nobody who has not asked for it there.
  sd_bus_call_method_async(sBus, nullptr, kRegistry, "/org/a11y/atspi/registry", kRegistry, "RegisterEvent",
                           nullptr, nullptr, "s", "object:state-changed:active");
  sAsking = ask({kRegistry, kRoot, kAccessible, "GetChildren"}, takePrograms, nullptr, "");
  return 0;
}

bool isAwaited() {
  if (sAsking != nullptr) return true;
  return std::ranges::any_of(sPrograms, [](const auto& entry) {
    const Program& program = entry.second;
    return program.asking != nullptr || program.findingProcess != nullptr ||
           std::ranges::any_of(program.frames,
                               [](const auto& each) { return each.second.asking != nullptr; });
  });
}

/// Waits as long as a question may take, once for all that is on its way.
void awaitAnswers() {
  const system::Limit limit = system::patience(system::kQueryLimit);
  const base::Deadline deadline(limit);
  sIsLate = sIsLate && isAwaited();
  while (!sIsLate && isAwaited()) {
    system::takeInBus();
    handle();
    if (!isAwaited()) return;
    const bool hasCome =
        sBus != nullptr ? system::waitForArrival(sBus, deadline) : system::waitForBus(deadline);
    if (hasCome) continue;
    system::noteWaitInVain(limit);
    sIsLate = true;
  }
}

}  // namespace

void takeInAccessibility() {
  handle();
  if (sBus == nullptr && sAsking == nullptr && sTried != base::turn()) {
    sTried = base::turn();
    sAsking = system::callLater(
        system::makeCall({"org.a11y.Bus", 0}, {"/org/a11y/bus", "org.a11y.Bus", "GetAddress"}), takeAddress,
        nullptr);
  }
  awaitAnswers();
}

std::vector<Window> windowsByAccessibility() {
  std::ptrdiff_t claims = 0;
  std::vector<Window> windows;
  for (const auto& [name, program] : sPrograms) {
    const auto claimed =
        std::ranges::count_if(program.frames, [](const auto& each) { return each.second.isActive; });
    claims += claimed;
    if (program.process == 0) continue;
    Window& window = windows.emplace_back();
    window.id.number = program.number;
    window.process = program.process;
    window.className = system::executableName(program.process);
    window.isActive = claimed > 0;
    window.isShown = true;
  }
  if (claims != 1) {
    for (Window& window : windows) window.isActive = false;
  }
  return windows;
}

void forgetAccessibility() { lose(); }

}  // namespace linux::windows::gnome
