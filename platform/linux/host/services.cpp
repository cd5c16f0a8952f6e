// The service manager's settings and distributed notifications.
//
// A notification is a signal on the session bus:
//
//   path       /com/tarn/kvd
//   interface  com.tarn.kvd.Notifications
//   member     Posted
//   arguments  s name, s object, a{sv} information
//
// so that a match on arg0 hears of one kind alone.

#include <map>
#include <string>
#include <variant>

#include "platform/base/values.h"
#include "platform/host.h"
#include "platform/linux/system/bus.h"

namespace {

constexpr std::int32_t kTransactionTracking = 16;

bool append(sd_bus_message* message, const base::Dictionary* dictionary);

bool appendNumber(sd_bus_message* message, const base::Number& number) {
  if (const auto* truth = std::get_if<bool>(&number.value)) {
    return sd_bus_message_append(message, "v", "b", *truth ? 1 : 0) >= 0;
  }
  if (const auto* integer = std::get_if<std::int64_t>(&number.value)) {
    return sd_bus_message_append(message, "v", "x", *integer) >= 0;
  }
  return sd_bus_message_append(message, "v", "d", std::get<double>(number.value)) >= 0;
}

bool appendData(sd_bus_message* message, const std::string& bytes) {
  return sd_bus_message_open_container(message, 'v', "ay") >= 0 &&
         sd_bus_message_append_array(message, 'y', bytes.data(), bytes.size()) >= 0 &&
         sd_bus_message_close_container(message) >= 0;
}

/// A value as a variant. What is none of these has no form on the bus.
bool appendValue(sd_bus_message* message, HostObject* value);

bool appendList(sd_bus_message* message, const base::List& list) {
  if (sd_bus_message_open_container(message, 'v', "av") < 0) return false;
  if (sd_bus_message_open_container(message, 'a', "v") < 0) return false;
  for (HostObject* item : list.items) {
    if (!appendValue(message, item)) return false;
  }
  // NOLINTNEXTLINE(misc-redundant-expression): it closes two containers
  return sd_bus_message_close_container(message) >= 0 && sd_bus_message_close_container(message) >= 0;
}

bool appendValue(sd_bus_message* message, HostObject* value) {
  if (const auto* text = base::as<base::String>(value)) {
    return sd_bus_message_append(message, "v", "s", text->text.c_str()) >= 0;
  }
  if (const auto* number = base::as<base::Number>(value)) return appendNumber(message, *number);
  if (const auto* data = base::as<base::Data>(value)) return appendData(message, data->bytes);
  if (const auto* list = base::as<base::List>(value)) return appendList(message, *list);
  const auto* dictionary = base::as<base::Dictionary>(value);
  return dictionary != nullptr && sd_bus_message_open_container(message, 'v', "a{sv}") >= 0 &&
         append(message, dictionary) && sd_bus_message_close_container(message) >= 0;
}

/// Appends a dictionary, or an empty one for null.
bool append(sd_bus_message* message, const base::Dictionary* dictionary) {
  if (sd_bus_message_open_container(message, 'a', "{sv}") < 0) return false;
  const base::Dictionary::Entries none;
  for (const auto& [key, value] : dictionary != nullptr ? dictionary->entries : none) {
    if (sd_bus_message_open_container(message, 'e', "sv") < 0 ||
        sd_bus_message_append(message, "s", key.c_str()) < 0 || !appendValue(message, value) ||
        sd_bus_message_close_container(message) < 0) {
      return false;
    }
  }
  return sd_bus_message_close_container(message) >= 0;
}

linux::system::Message newNotification() {
  sd_bus_message* message = nullptr;
  sd_bus* const connection = linux::system::bus();
  if (connection == nullptr || sd_bus_message_new_signal(connection, &message, "/com/tarn/kvd",
                                                         "com.tarn.kvd.Notifications", "Posted") < 0) {
    return nullptr;
  }
  return linux::system::Message(message);
}

}  // namespace

/// The service manager counts nothing that is under way: it asks with SIGTERM, waits until the process has
/// ended, and takes messages for the next one meanwhile. The setting is remembered and changes nothing.
std::int32_t HostEnableServiceTransactions(std::int32_t setting, std::int64_t value, std::int64_t* previous) {
  static std::int64_t sTracking = 0;
  if (setting != kTransactionTracking) return -1;
  if (previous != nullptr) *previous = sTracking;
  sTracking = value;
  return 0;
}

/// A signal is sent at once, so that there is nothing to hurry.
void HostPostDistributedNotification(HostStringRef name, HostStringRef object,
                                     HostDictionaryRef userInformation, bool) {
  linux::system::Message message = newNotification();
  if (message == nullptr) return;
  if (sd_bus_message_append(message.get(), "ss", base::textOf(name).c_str(), base::textOf(object).c_str()) <
          0 ||
      !append(message.get(), base::as<base::Dictionary>(userInformation))) {
    return;
  }
  linux::system::send(std::move(message));
}
