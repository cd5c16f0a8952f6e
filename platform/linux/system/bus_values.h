// Reading the values that programs send over the bus. Whatever they send, at worst nothing is read.
#pragma once

#include <systemd/sd-bus.h>

#include <optional>
#include <string>
#include <string_view>

namespace linux::system {

/// The longest text that is kept, in bytes: a title, an address.
inline constexpr std::size_t kLongestText = 4096;

/// A value of this type that comes next in a message: a text or an object path, cut at the longest text.
/// Nothing for any other type.
std::optional<std::string> readText(sd_bus_message* message, std::string_view type);

/// The same for numbers of any type; those that are not finite read as nothing.
std::optional<double> readNumber(sd_bus_message* message, std::string_view type);

std::optional<bool> readBoolean(sd_bus_message* message, std::string_view type);

/// Reads an a{sv} that comes next in a message: calls take(key, type) where a value is due. It may read the
/// value or leave it; a value that it leaves half read ends the reading.
template <typename Take>
void readDictionary(sd_bus_message* message, Take take) {
  if (sd_bus_message_enter_container(message, SD_BUS_TYPE_ARRAY, "{sv}") <= 0) return;
  while (sd_bus_message_enter_container(message, SD_BUS_TYPE_DICT_ENTRY, "sv") > 0) {
    const char* key = nullptr;
    const char* type = nullptr;
    if (sd_bus_message_read_basic(message, SD_BUS_TYPE_STRING, &key) <= 0 ||
        sd_bus_message_peek_type(message, nullptr, &type) <= 0 ||
        sd_bus_message_enter_container(message, SD_BUS_TYPE_VARIANT, type) <= 0) {
      return;
    }
    take(std::string_view(key), std::string_view(type));
    if (sd_bus_message_at_end(message, 0) == 0 && sd_bus_message_skip(message, type) < 0) return;
    // NOLINTNEXTLINE(misc-redundant-expression): it leaves two containers
    if (sd_bus_message_exit_container(message) < 0 || sd_bus_message_exit_container(message) < 0) return;
  }
  sd_bus_message_exit_container(message);
}

}  // namespace linux::system
