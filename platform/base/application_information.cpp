#include "platform/base/application_information.h"

#include <string>
#include <utility>

#include "platform/base/values.h"

namespace base {

HostObject* copyInformationItem(const ApplicationInstance& instance, HostStringRef key) {
  if (HostStringsAreEqual(key, HostGetBundleIdentifierKey())) {
    return new String(std::string(instance.identifier));
  }
  if (HostStringsAreEqual(key, HostGetBundleVersionKey())) {
    return instance.version.empty() ? nullptr : new String(std::string(instance.version));
  }
  if (HostStringsAreEqual(key, HostGetSerialNumberKey())) return new SerialNumber(instance.serialNumber);
  return nullptr;
}

HostDictionaryRef copyInformation(const ApplicationInstance& instance, HostStringRef key) {
  Dictionary::Entries entries;
  if (HostObject* const item = copyInformationItem(instance, key)) entries.emplace_back(textOf(key), item);
  return HostDictionaryRef(new Dictionary(std::move(entries)));
}

bool hasInformation(const ApplicationInstance& instance, std::size_t count, const HostStringRef* keys,
                    HostObject* const* values) {
  for (std::size_t i = 0; i < count; ++i) {
    const Owned<HostObject> actual(copyInformationItem(instance, keys[i]));
    if (!HostStringsAreEqual(HostAsString(actual.get()), HostAsString(values[i]))) return false;
  }
  return true;
}

}  // namespace base
