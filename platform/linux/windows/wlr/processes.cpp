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

constexpr Question kLanguages[] = {
    askSway,
    askHyprland,
};

/// The windows as the compositor tells them in its own language; none where it has none that is known.
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

}  // namespace

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
  // meet as they should. A title may have changed between the two tellings.
  std::ranges::sort(unknown, {}, &wayland::Toplevel::age);
  for (const bool byTitle : {true, false}) {
    for (wayland::Toplevel* const window : unknown) {
      if (window->container != 0) continue;
      const auto same = std::ranges::find_if(containers, [&](const Container& container) {
        return container.applicationID == window->description.applicationID &&
               (!byTitle || container.title == window->description.title);
      });
      if (same == containers.end()) continue;
      window->container = same->id;
      window->process = same->process;
      containers.erase(same);
    }
  }
}

std::optional<Container> lookAt(pid_t compositor, const wayland::Toplevel& window) {
  const auto containers = readContainers(compositor);
  const auto found = std::ranges::find(containers, window.container, &Container::id);
  if (found == containers.end()) return std::nullopt;
  return *found;
}

}  // namespace linux::windows::wlr
