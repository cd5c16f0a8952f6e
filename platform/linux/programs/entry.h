// An installed program as its desktop entry tells (Desktop Entry Specification 1.5), and the record of it
// that kvd-entries writes and kvd reads: an object of JSON on a line of its own.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/linux/programs/role.h"

namespace linux::programs {

/// An installed program that plays a role or takes the remote itself, by its entry or by the table of
/// well-known programs.
struct Entry {
  /// Without ".desktop".
  std::string id;
  /// StartupWMClass; may be empty.
  std::string windowClass;
  Role role = Role::None;
  /// A person or packager has written the role into the entry (X-Kvd-Application), which goes before all
  /// else. So written with an unknown identifier, or none, the program plays no role.
  bool cast = false;
  /// It was written there instead that the program takes the remote itself.
  bool takesRemote = false;
  /// Can be started over the bus by its own name.
  bool busActivatable = false;
  std::string directory;
  /// The program and its arguments, without the places for files.
  std::vector<std::string> command;
};

/// Asks kvd-entries for the identifier of the default music player instead.
inline constexpr const char* kDefaultMusicPlayerOption = "--default-music-player";

/// The words of an Exec line that are left when no file is given: without those that hold a field code, and
/// "%%" is a "%".
std::vector<std::string> withoutFieldCodes(const std::vector<std::string>& words);

/// The record, with the end of its line.
std::string toRecord(const Entry& entry);
/// Nothing for a line that is no record, whatever else it is.
std::optional<Entry> fromRecord(std::string_view line);

}  // namespace linux::programs
