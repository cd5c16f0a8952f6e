#include "platform/base/object.h"

namespace {

/// Head of the table of live objects.
HostObject* first = nullptr;

}  // namespace

HostObject::HostObject(base::Kind kindOfObject) : kind(kindOfObject), next(first) {
  if (first != nullptr) first->previous = this;
  first = this;
}

HostObject::~HostObject() {
  (previous != nullptr ? previous->next : first) = next;
  if (next != nullptr) next->previous = previous;
}

void HostRetain(HostObject* object) {
  if (object != nullptr && !object->immortal) ++object->references;
}

void HostRelease(HostObject* object) {
  if (object == nullptr || object->immortal) return;
  if (--object->references == 0) delete object;
}

namespace base {

std::string_view kindName(Kind kind) {
  static constexpr std::array<std::string_view, kKindCount> names = {
      "string",        "list",          "dictionary", "number",       "data",      "location",
      "bundle",        "serial number", "run loop",   "source",       "timer",     "port",
      "release scope", "script",        "descriptor", "event source", "key event", "event contents"};
  return names.at(static_cast<std::size_t>(kind));
}

std::array<std::size_t, kKindCount> aliveByKind() {
  std::array<std::size_t, kKindCount> alive{};
  for (const HostObject* object = first; object != nullptr; object = object->next) {
    if (!object->immortal) ++alive.at(static_cast<std::size_t>(object->kind));
  }
  return alive;
}

}  // namespace base
