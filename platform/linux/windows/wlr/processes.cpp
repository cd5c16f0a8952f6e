#include "platform/linux/windows/wlr/processes.h"

#include <algorithm>
#include <iterator>

#include "platform/base/deadline.h"
#include "platform/linux/system/turn.h"
#include "platform/linux/windows/wlr/hyprland.h"
#include "platform/linux/windows/wlr/sway.h"

namespace linux::windows::wlr {

namespace {

using Question = std::vector<Container> (*)(pid_t compositor, const base::Deadline& deadline);

/// What must be the same in both tellings. Either may have changed between the two, and sway's protocol goes
/// on with the application id that a window had first.
enum class By : std::uint8_t { Both, ApplicationID, Title };

bool areSame(const Container& container, const wayland::Description& told, By by) {
  return (by == By::Title || container.applicationID == told.applicationID) &&
         (by == By::ApplicationID || container.title == told.title);
}

constexpr Question kLanguages[] = {
    askSway,
    askHyprland,
};

}  // namespace

std::vector<Container> readContainers(pid_t compositor) {
  if (compositor == 0 || system::timedOutThisTurn(compositor)) return {};
  const system::Limit limit = system::patience(system::kQueryLimit);
  const base::Deadline deadline(limit);
  for (const Question ask : kLanguages) {
    auto containers = ask(compositor, deadline);
    if (!containers.empty()) return containers;
  }
  if (deadline.hasPassed()) {
    system::noteWaitInVain(limit);
    system::noteTimeout(compositor);
  }
  return {};
}

void findProcesses(pid_t compositor, const std::vector<wayland::Toplevel*>& windows) {
  std::vector<wayland::Toplevel*> unknown;
  std::ranges::copy_if(windows, std::back_inserter(unknown),
                       [](const wayland::Toplevel* window) { return window->container == 0; });
  if (unknown.empty()) return;
  std::vector<Container> containers = readContainers(compositor);
  const auto isTaken = [&](const Container& container) {
    return std::ranges::find(windows, container.id, &wayland::Toplevel::container) != windows.end();
  };
  std::erase_if(containers, isTaken);
  // Both sides in the order in which the windows were opened, so that those which nothing else tells apart
  // meet as they should.
  std::ranges::sort(unknown, {}, &wayland::Toplevel::age);
  for (const By by : {By::Both, By::ApplicationID, By::Title}) {
    for (wayland::Toplevel* const window : unknown) {
      if (window->container != 0) continue;
      const auto same = std::ranges::find_if(
          containers, [&](const Container& each) { return areSame(each, window->description, by); });
      if (same == containers.end()) continue;
      window->container = same->id;
      window->process = same->process;
      window->applicationID = same->applicationID;
      containers.erase(same);
    }
  }
}

}  // namespace linux::windows::wlr
