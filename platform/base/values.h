// The plain values behind the handles: strings, lists, dictionaries, numbers, data, serial numbers, results,
// events.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <utility>
#include <variant>
#include <vector>

#include "platform/base/object.h"

namespace base {

struct String final : HostObject {
  static constexpr Kind kKind = Kind::String;
  explicit String(std::string value) : HostObject(kKind), text(std::move(value)) {}
  const std::string text;
};

/// Owns one reference to each item.
struct List final : HostObject {
  static constexpr Kind kKind = Kind::List;
  explicit List(std::vector<HostObject*> owned) : HostObject(kKind), items(std::move(owned)) {}
  ~List() override;
  const std::vector<HostObject*> items;
};

/// Owns one reference to each value.
struct Dictionary final : HostObject {
  static constexpr Kind kKind = Kind::Dictionary;
  using Entries = std::vector<std::pair<std::string, HostObject*>>;
  explicit Dictionary(Entries owned) : HostObject(kKind), entries(std::move(owned)) {}
  ~Dictionary() override;
  const Entries entries;
};

struct Number final : HostObject {
  static constexpr Kind kKind = Kind::Number;
  using Content = std::variant<bool, std::int64_t, double>;
  explicit Number(Content content) : HostObject(kKind), value(content) {}
  const Content value;
};

struct Data final : HostObject {
  static constexpr Kind kKind = Kind::Data;
  explicit Data(std::string content) : HostObject(kKind), bytes(std::move(content)) {}
  const std::string bytes;
};

/// One running instance of an application.
struct SerialNumber final : HostObject {
  static constexpr Kind kKind = Kind::SerialNumber;
  explicit SerialNumber(HostProcessSerialNumber parts) : HostObject(kKind), process(parts) {}
  const HostProcessSerialNumber process;
};

/// What a script answered: the value as an integer and as a four-character code.
struct Descriptor final : HostObject {
  static constexpr Kind kKind = Kind::Descriptor;
  Descriptor(std::int32_t number, std::uint32_t constant)
      : HostObject(kKind), integer(number), typeCode(constant) {}
  const std::int32_t integer;
  const std::uint32_t typeCode;
};

/// What is behind a HostEventDescriptor: plain data, or an event with its target's data.
struct EventContents final : HostObject {
  static constexpr Kind kKind = Kind::EventContents;
  EventContents() : HostObject(kKind) {}
  std::uint32_t type = 0;
  std::string data;
  bool isEvent = false;
  std::uint32_t eventClass = 0;
  std::uint32_t eventID = 0;
  std::int16_t returnID = 0;
  std::int32_t transactionID = 0;
};

/// The process that an event is for; nothing for null, for plain data and for another kind of target.
std::optional<HostProcessSerialNumber> targetOf(const HostEventDescriptor* event);

/// The string's text; empty for null or another kind.
const std::string& textOf(HostStringRef string);

}  // namespace base
