// One remote that is open.
#pragma once

#include <libevdev/libevdev.h>

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <system_error>

#include "platform/base/file_descriptor.h"
#include "receiver/clock.h"
#include "receiver/handles.h"

namespace receiver {

/// A key that changed.
struct Change {
  std::uint16_t key = 0;
  bool down = false;
  /// What MSC_SCAN told of it, if anything.
  std::optional<std::uint32_t> scan;
  Time time{0};
  /// It waited so long that it is from before the machine slept, or from before the daemon hung.
  bool stale = false;
  /// The desktop did not get it.
  bool grabbed = false;
};

class Device {
 public:
  struct Listener {
    std::function<void(const Change&)> changed;
    /// Events were lost, and the state of the keys with them.
    std::function<void()> confused;
    /// The device cannot be read any more. It may be destroyed in the call.
    std::function<void()> gone;
  };

  /// Opens a device and reads it on the loop. Throws std::system_error where it cannot.
  Device(sd_event* loop, const std::string& path, Listener listener);

  /// Keeps the device from everybody else, or no longer; it comes about when no key is down, for whoever saw
  /// a press must see its release. False where somebody else has it grabbed.
  bool setGrabbed(bool grabbed);

 private:
  struct Closer {
    void operator()(libevdev* device) const { libevdev_free(device); }
  };

  void read();
  bool drain(unsigned flag);
  void take(const input_event& event);
  Time timeOf(const input_event& event, Time now);
  bool anyKeyDown() const;
  bool settleGrab();

  Listener listener_;
  base::FileDescriptor file_;
  std::unique_ptr<libevdev, Closer> device_;
  bool clockKnown_ = false;
  /// What to add to a time of an unknown clock.
  std::optional<Time> offset_;
  std::optional<std::uint32_t> scan_;
  bool wantsGrab_ = false;
  bool grabbed_ = false;
  /// Last: no event may come before or after the rest is there.
  Source source_;
};

}  // namespace receiver
