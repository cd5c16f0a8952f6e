// The input devices that there are, as udev tells them.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "receiver/handles.h"
#include "receiver/verdict.h"

namespace receiver {

/// All input devices with keys, in the order of their numbers, with their verdicts. `named` are paths of
/// device nodes, or names of devices, that the command line calls remotes.
std::vector<Node> findDevices(const std::vector<std::string>& named);

/// Calls `changed` when an input device comes, goes or changes, for as long as the monitor lives; never where
/// udev cannot be listened to.
class DeviceMonitor {
 public:
  DeviceMonitor(sd_event* loop, std::function<void()> changed);

 private:
  std::function<void()> changed_;
  UdevMonitor monitor_;
};

}  // namespace receiver
