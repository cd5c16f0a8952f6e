#include "platform/linux/system/bus_values.h"

#include <cmath>
#include <cstdint>

#include "platform/text/utf8.h"

namespace linux::system {

namespace {

template <typename Wire>
std::optional<Wire> readBasic(sd_bus_message* message, char type) {
  Wire value{};
  if (sd_bus_message_read_basic(message, type, &value) <= 0) return std::nullopt;
  return value;
}

template <typename Wire>
std::optional<double> readAs(sd_bus_message* message, char type) {
  const auto value = readBasic<Wire>(message, type);
  if (!value || !std::isfinite(static_cast<double>(*value))) return std::nullopt;
  return static_cast<double>(*value);
}

}  // namespace

std::optional<std::string> readText(sd_bus_message* message, std::string_view type) {
  if (type != "s" && type != "o") return std::nullopt;
  const auto text = readBasic<const char*>(message, type.front());
  if (!text) return std::nullopt;
  return std::string(text::truncated(*text, kLongestText));
}

std::optional<double> readNumber(sd_bus_message* message, std::string_view type) {
  if (type == "d") return readAs<double>(message, SD_BUS_TYPE_DOUBLE);
  if (type == "x") return readAs<std::int64_t>(message, SD_BUS_TYPE_INT64);
  if (type == "t") return readAs<std::uint64_t>(message, SD_BUS_TYPE_UINT64);
  if (type == "i") return readAs<std::int32_t>(message, SD_BUS_TYPE_INT32);
  if (type == "u") return readAs<std::uint32_t>(message, SD_BUS_TYPE_UINT32);
  return std::nullopt;
}

std::optional<bool> readBoolean(sd_bus_message* message, std::string_view type) {
  if (type != "b") return std::nullopt;
  const auto value = readBasic<int>(message, SD_BUS_TYPE_BOOLEAN);
  if (!value) return std::nullopt;
  return *value != 0;
}

}  // namespace linux::system
