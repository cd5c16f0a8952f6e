// Which program accessibility says is in front, for a shell that tells nothing: GTK's and Qt's programs say
// on a bus of their own when a window of theirs becomes active and when it no longer is.
#pragma once

#include <vector>

#include "platform/linux/windows/window.h"

namespace linux::windows::gnome {

/// Takes in what has come, and waits for answers that are on their way; begins to follow the programs where
/// that is not done yet.
void takeInAccessibility();

/// One window for each program that has spoken, without the back end in its id. It is active where it alone
/// says so: some programs always do.
std::vector<Window> windowsByAccessibility();

/// Ends it, and forgets the programs.
void forgetAccessibility();

}  // namespace linux::windows::gnome
