// What udev knows of devices, through sd-device.
#pragma once

#include <functional>
#include <string>

#include "receiver/handles.h"

namespace receiver {

/// Visits the devices of a subsystem whose kernel names fit a pattern ("event*"). Those that udev has not
/// dealt with yet are among them.
void forEachDevice(const char* subsystem, const char* pattern, const std::function<void(sd_device*)>& visit);

/// The path of its device node; empty when it has none.
std::string nodeOf(sd_device* device);

/// An attribute in sysfs; empty when there is none, and for a null device.
std::string attributeOf(sd_device* device, const char* name);

/// Whether udev has set a property to 1.
bool hasFlag(sd_device* device, const char* name);

/// The nearest parent in a subsystem, and of a type where one is given; borrowed from the child, null when
/// there is none.
sd_device* parentOf(sd_device* device, const char* subsystem, const char* type = nullptr);

/// Where the device lies in sysfs; empty for a null device.
std::string sysfsPathOf(sd_device* device);

}  // namespace receiver
