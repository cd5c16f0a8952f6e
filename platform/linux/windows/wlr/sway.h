// The protocol of i3 and sway: what the compositor tells of windows to whoever asks.
#pragma once

#include <sys/types.h>

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace linux::windows::wlr {

/// A window in sway's tree.
struct Container {
  /// The later a window was opened, the greater; never 0.
  std::int64_t id = 0;
  pid_t process = 0;
  std::string applicationID;
  std::string title;
  /// On a workspace that is shown.
  bool isVisible = false;
  /// The name of the output that shows it.
  std::string output;
};

/// Asks the compositor with this process for its windows. None where it does not speak the protocol or does
/// not answer in time.
std::vector<Container> readContainers(pid_t compositor);

/// The windows in an answer in JSON, in the order in which they were opened; none when it is no such answer.
std::vector<Container> containersIn(std::string_view tree);

}  // namespace linux::windows::wlr
