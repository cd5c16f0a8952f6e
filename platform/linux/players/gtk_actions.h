// The actions that GTK programs export on the session bus (org.gtk.Actions): they work unfocused, and do not
// depend on the keyboard.
//
// An action is "win.NAME" of the window that a person would type into, or "app.NAME" of its program.
#pragma once

#include <optional>

#include "platform/linux/windows/window.h"

namespace linux::players {

/// Activates an action and does not wait, as the answer says nothing; "win.NAME=true" and "win.NAME=false"
/// bring an action with a boolean state into that state instead. False when the window exports no such
/// action.
bool activateAction(const windows::Window& window, const char* action);

struct ActionDescription {
  bool isEnabled = false;
  /// Of an action with a boolean state.
  std::optional<bool> state;
};

/// What a program tells of an action. Nothing when there is no such action, or no answer.
std::optional<ActionDescription> describeAction(const windows::Window& window, const char* action);

}  // namespace linux::players
