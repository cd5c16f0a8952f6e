#include "platform/base/values.h"

#include <algorithm>

namespace base {

List::~List() {
  for (HostObject* item : items) HostRelease(item);
}

Dictionary::~Dictionary() {
  for (const auto& [key, value] : entries) HostRelease(value);
}

const std::string& textOf(HostStringRef string) {
  static const std::string empty;
  const auto* found = as<String>(string);
  return found != nullptr ? found->text : empty;
}

}  // namespace base

using base::as;

std::size_t HostListGetCount(HostListRef list) {
  const auto* found = as<base::List>(list);
  return found != nullptr ? found->items.size() : 0;
}

HostObject* HostListGetItem(HostListRef list, std::size_t index) {
  return index < HostListGetCount(list) ? as<base::List>(list)->items[index] : nullptr;
}

HostObject* HostDictionaryGetValue(HostDictionaryRef dictionary, HostStringRef key) {
  const auto* found = as<base::Dictionary>(dictionary);
  const auto* wanted = as<base::String>(key);
  if (found == nullptr || wanted == nullptr) return nullptr;
  const auto entry =
      std::ranges::find(found->entries, wanted->text, &base::Dictionary::Entries::value_type::first);
  return entry != found->entries.end() ? entry->second : nullptr;
}

HostSerialNumberRef HostAsSerialNumber(HostObject* object) {
  return HostSerialNumberRef(as<base::SerialNumber>(object));
}

HostSerialNumberRef HostCopyApplicationSerialNumber(HostSerialNumberRef serialNumber) {
  const auto* original = as<base::SerialNumber>(serialNumber);
  if (original == nullptr) return nullptr;
  return HostSerialNumberRef(new base::SerialNumber(original->process));
}

std::uint32_t HostExtractSerialNumberParts(HostSerialNumberRef serialNumber, std::uint32_t* high,
                                           std::uint32_t* low) {
  const auto* number = as<base::SerialNumber>(serialNumber);
  if (number == nullptr || high == nullptr || low == nullptr) return 0;
  *high = number->process.high;
  *low = number->process.low;
  return 1;
}

std::int32_t HostDescriptorInt32Value(HostDescriptorRef descriptor) {
  const auto* result = as<base::Descriptor>(descriptor);
  return result != nullptr ? result->integer : 0;
}

std::uint32_t HostDescriptorTypeCodeValue(HostDescriptorRef descriptor) {
  const auto* result = as<base::Descriptor>(descriptor);
  return result != nullptr ? result->typeCode : 0;
}
