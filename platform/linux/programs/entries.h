// The installed programs, as their desktop entries tell (Desktop Entry Specification 1.5).
//
// The entries are read with GIO in a short-lived child process: it watches directories from a thread of its
// own and keeps every entry in memory, and the daemon stays one small thread.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "platform/linux/programs/role.h"

namespace linux::programs {

/// An installed program that plays a role, by its entry or by the table of well-known programs.
struct Entry {
  /// Without ".desktop".
  std::string id;
  /// StartupWMClass; may be empty.
  std::string windowClass;
  Role role = Role::None;
  /// A person or packager has written the role into the entry (X-Kvd-Application), which goes before all
  /// else. So written with an unknown identifier, or none, the program plays no role.
  bool cast = false;
  /// Can be started over the bus by its own name.
  bool busActivatable = false;
  /// The program and its arguments, without the places for files.
  std::vector<std::string> command;
  std::string directory;
};

/// The entries, read again when an application directory has changed.
const std::vector<Entry>& entries();

/// By id, without regard to case; null when there is none.
const Entry* entryByID(std::string_view id);
/// By StartupWMClass, else by id; without regard to case.
const Entry* entryByWindowClass(std::string_view windowClass);

/// The person's default program for music files, if it plays the jukebox's role; "" otherwise. Asked afresh.
std::string defaultMusicPlayer();

}  // namespace linux::programs
