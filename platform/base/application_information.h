// What is told of a running instance of an application, whichever host knows it.
#pragma once

#include <cstddef>
#include <string_view>

#include "platform/host.h"

namespace base {

/// An instance; the texts are borrowed.
struct ApplicationInstance {
  HostProcessSerialNumber serialNumber;
  std::string_view identifier;
  /// Empty when it has none.
  std::string_view version;
};

/// What the instance has under an information key, owned; null when that is nothing.
HostObject* copyInformationItem(const ApplicationInstance& instance, HostStringRef key);

/// A dictionary of it, owned; without entries when that is nothing.
HostDictionaryRef copyInformation(const ApplicationInstance& instance, HostStringRef key);

/// Whether the instance has each of these texts under its key.
bool hasInformation(const ApplicationInstance& instance, std::size_t count, const HostStringRef* keys,
                    HostObject* const* values);

}  // namespace base
