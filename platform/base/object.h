// Counted objects: what is behind every handle of platform/host.h.
//
// An object begins with one reference, which belongs to whoever made it. Every live object stands in one
// table, so that a test can ask what is alive, by kind: that shows leaks, and the few references that are
// kept on purpose.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <string_view>

#include "platform/host.h"

namespace base {

enum class Kind : std::uint8_t {
  String,
  List,
  Dictionary,
  Number,
  Data,
  Location,
  Bundle,
  SerialNumber,
  RunLoop,
  Source,
  Timer,
  Port,
  ReleaseScope,
  Script,
  Descriptor,
  EventSource,
  KeyEvent,
  EventContents,
};
inline constexpr std::size_t kKindCount = static_cast<std::size_t>(Kind::EventContents) + 1;

/// The kind in words, for reports ("serial number").
std::string_view kindName(Kind kind);

/// How many objects of each kind are alive, immortal ones not counted.
std::array<std::size_t, kKindCount> aliveByKind();

}  // namespace base

struct HostObject {
  explicit HostObject(base::Kind kind);
  HostObject(const HostObject&) = delete;
  HostObject& operator=(const HostObject&) = delete;
  virtual ~HostObject();

  const base::Kind kind;
  std::uint32_t references = 1;
  /// Never ends and is not counted as alive: constant strings, the run loop.
  bool immortal = false;

  /// Neighbours in the table of live objects.
  HostObject* next = nullptr;
  HostObject* previous = nullptr;
};

namespace base {

/// The object as a T (a type with a kKind), or null when it is null or of another kind.
template <typename T>
T* as(HostObject* object) {
  return object != nullptr && object->kind == T::kKind ? static_cast<T*>(object) : nullptr;
}
template <typename T, typename Kind>
T* as(HostHandle<Kind> handle) {
  return as<T>(handle.object);
}

struct Releaser {
  void operator()(HostObject* object) const { HostRelease(object); }
};
/// One reference, dropped when the pointer goes.
template <typename T>
using Owned = std::unique_ptr<T, Releaser>;
/// A further reference to the object.
template <typename T>
Owned<T> retained(T* object) {
  HostRetain(object);
  return Owned<T>(object);
}

/// Gives one reference to the innermost open release scope; without an open scope the object stays with the
/// caller. Returns the object.
HostObject* makeTemporary(HostObject* object);

/// How many release scopes are open.
std::size_t openScopes();

}  // namespace base
