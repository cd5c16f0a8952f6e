#include "platform/linux/programs/own_remote.h"

#include <algorithm>

#include "platform/linux/programs/casting.h"
#include "platform/linux/system/process.h"
#include "platform/linux/windows/windows.h"

namespace linux::programs {

namespace {

/// The taker that the process runs; null where it runs something else.
const Program* takerRunBy(pid_t process) {
  const std::string executable = process != 0 ? system::executableName(process) : std::string();
  const auto found = std::ranges::find_if(programs(), [&](const Program& program) {
    return program.takesRemote && !executable.empty() && executable == program.executable;
  });
  return found != programs().end() ? &*found : nullptr;
}

/// The taker that a window is of; empty where it is of another program.
std::string takerBehind(const windows::Window& window) {
  const Casting casting = castWindow(window);
  if (casting.takesRemote) return casting.program != nullptr ? casting.program->name : casting.entry;
  const Program* const program = takerRunBy(window.process);
  return program != nullptr && !casting.byEntry ? program->name : "";
}

}  // namespace

std::string takerOfRemote() {
  if (windows::knowsFront()) {
    const windows::Window* const front = windows::front();
    return front != nullptr ? takerBehind(*front) : "";
  }
  for (const windows::Window& window : windows::list()) {
    if (std::string name = takerBehind(window); !name.empty()) return name;
  }
  for (const pid_t process : system::ownProcesses()) {
    if (const Program* const program = takerRunBy(process)) return program->name;
  }
  return "";
}

}  // namespace linux::programs
