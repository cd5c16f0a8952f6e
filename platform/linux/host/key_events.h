// Events of a keyboard, before they are posted to anybody.
#pragma once

#include <cstdint>

#include "platform/base/object.h"
#include "platform/linux/windows/backend.h"
#include "platform/linux/windows/window.h"

namespace linux::host {

/// Key state of its own: what the person holds down on the keyboard does not count.
struct EventSource final : HostObject {
  static constexpr base::Kind kKind = base::Kind::EventSource;
  EventSource() : HostObject(kKind) {}
  bool shiftIsDown = false;
  /// The window that took the last press and is owed the release; by then another may be the right one.
  windows::ID pressedIn;

  windows::Modifiers modifiers() const { return shiftIsDown ? windows::kShift : windows::kNoModifier; }
};

struct KeyEvent final : HostObject {
  static constexpr base::Kind kKind = base::Kind::KeyEvent;
  KeyEvent(EventSource* from, std::uint16_t key, bool isDown)
      : HostObject(kKind), source(base::retained(from)), virtualKey(key), down(isDown) {}
  const base::Owned<EventSource> source;
  const std::uint16_t virtualKey;
  const bool down;
};

}  // namespace linux::host
