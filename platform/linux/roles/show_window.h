// The window in which a program shows slides or photos.
#pragma once

#include <vector>

#include "platform/linux/roles/performer.h"

namespace linux::roles {

/// The window of a program that is a show, by what the program's row says: a full-screen one, and not its
/// ordinary window made full screen. Null when there is none; belongs to the performer.
const windows::Window* showWindow(const Performer& performer);

/// The windows with documents in them, topmost first: no dialogs, and none of another kind of document. They
/// belong to the performer.
std::vector<const windows::Window*> documentWindows(const Performer& performer);

/// Whether there is one, and the program is not Stopped as a player.
bool showRuns(const Performer& performer);

}  // namespace linux::roles
