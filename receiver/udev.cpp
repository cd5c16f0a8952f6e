#include "receiver/udev.h"

namespace receiver {
namespace {

/// What a getter of sd-device gives of a device; empty when it fails.
template <typename Getter, typename... Name>
std::string text(Getter get, sd_device* device, Name... name) {
  const char* value = nullptr;
  return get(device, name..., &value) >= 0 && value != nullptr ? value : "";
}

}  // namespace

void forEachDevice(const char* subsystem, const char* pattern, const std::function<void(sd_device*)>& visit) {
  sd_device_enumerator* made = nullptr;
  if (sd_device_enumerator_new(&made) < 0) return;
  const UdevEnumerator enumerator(made);
  sd_device_enumerator_add_match_subsystem(made, subsystem, 1);
  sd_device_enumerator_add_match_sysname(made, pattern);
  sd_device_enumerator_allow_uninitialized(made);
  for (sd_device* device = sd_device_enumerator_get_device_first(made); device != nullptr;
       device = sd_device_enumerator_get_device_next(made)) {
    visit(device);
  }
}

std::string nodeOf(sd_device* device) { return text(sd_device_get_devname, device); }

std::string attributeOf(sd_device* device, const char* name) {
  return device == nullptr ? "" : text(sd_device_get_sysattr_value, device, name);
}

bool hasFlag(sd_device* device, const char* name) {
  return text(sd_device_get_property_value, device, name) == "1";
}

sd_device* parentOf(sd_device* device, const char* subsystem, const char* type) {
  sd_device* parent = nullptr;
  return sd_device_get_parent_with_subsystem_devtype(device, subsystem, type, &parent) < 0 ? nullptr : parent;
}

std::string sysfsPathOf(sd_device* device) {
  return device == nullptr ? "" : text(sd_device_get_syspath, device);
}

}  // namespace receiver
