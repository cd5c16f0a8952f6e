// What the extension in GNOME Shell tells of windows (packaging/gnome-shell).
//
// The shell is asked as soon as it says that something has changed, so that a button finds the answer there.
#pragma once

#include <cstdint>
#include <vector>

#include "platform/linux/windows/window.h"

namespace linux::windows::gnome {

/// Who is there to be asked.
enum class Shell : std::uint8_t {
  None,
  /// Without the extension.
  Silent,
  Telling,
};

/// Takes in what the shell has said, and waits for an answer that is on its way.
Shell takeInShell();
/// Who was there when that was last done.
Shell shell();

/// The windows told of, topmost first, without the back end in their ids; none unless one is telling.
const std::vector<Window>& windowsTold();
const std::vector<Output>& outputsTold();

/// Has the window activated, as by the person.
void activateTold(std::uint64_t window);

/// Forgets the shell; a later takeInShell begins anew.
void forgetShell();

}  // namespace linux::windows::gnome
