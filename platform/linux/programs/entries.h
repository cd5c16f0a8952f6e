// The installed programs, as their desktop entries tell.
//
// The entries are read with GIO in a short-lived child process: it watches directories from a thread of its
// own and keeps every entry in memory, and the daemon stays one small thread.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "platform/linux/programs/entry.h"

namespace linux::programs {

/// The entries, read again when an application directory has changed.
const std::vector<Entry>& entries();

/// By id, without regard to case; null when there is none.
const Entry* entryByID(std::string_view id);
/// By StartupWMClass, else by id; without regard to case.
const Entry* entryByWindowClass(std::string_view windowClass);

/// The person's default program for music files, if it plays the jukebox's role; "" otherwise. Asked afresh.
std::string defaultMusicPlayer();

}  // namespace linux::programs
