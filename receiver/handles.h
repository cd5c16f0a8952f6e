// Owners of what libsystemd gives out.
#pragma once

#include <systemd/sd-bus.h>
#include <systemd/sd-device.h>
#include <systemd/sd-event.h>

#include <memory>

namespace receiver {

/// Calls one of the library's functions, by its address, on what an owner lets go of.
template <auto release>
struct Releaser {
  template <typename Handle>
  void operator()(Handle* handle) const {
    release(handle);
  }
};

using Loop = std::unique_ptr<sd_event, Releaser<sd_event_unref>>;
using Source = std::unique_ptr<sd_event_source, Releaser<sd_event_source_disable_unref>>;
using Bus = std::unique_ptr<sd_bus, Releaser<sd_bus_flush_close_unref>>;
using Slot = std::unique_ptr<sd_bus_slot, Releaser<sd_bus_slot_unref>>;
using Message = std::unique_ptr<sd_bus_message, Releaser<sd_bus_message_unref>>;
using UdevDevice = std::unique_ptr<sd_device, Releaser<sd_device_unref>>;
using UdevEnumerator = std::unique_ptr<sd_device_enumerator, Releaser<sd_device_enumerator_unref>>;
using UdevMonitor = std::unique_ptr<sd_device_monitor, Releaser<sd_device_monitor_unref>>;

/// A run loop of one's own. Throws std::system_error where none can be made.
Loop makeLoop();

}  // namespace receiver
