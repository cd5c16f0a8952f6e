// The seven roles, and the programs known to play them.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>

namespace desktop {

enum class Role : std::uint8_t {
  None,
  Jukebox,
  DiscPlayer,
  ClassicMovies,
  ModernMovies,
  Presentation,
  PhotoLibrary,
  ProfessionalPhotos,
};

/// The bundle identifier that stands for a role; "" for None.
const char* bundleIdentifier(Role role);
/// The role behind a bundle identifier, compared exactly; None for any other text.
Role roleOf(std::string_view bundleIdentifier);

/// What a program does differently from what its interfaces promise.
enum Quirk : std::uint8_t {
  kNoQuirk = 0,
  /// Takes a Rate and goes on as before.
  kIgnoresRate = 1,
  /// Raise succeeds and raises nothing.
  kIgnoresRaise = 2,
};

/// A well-known program. Empty texts are names that it does not have.
struct Program {
  Role role;
  const char* name;
  /// Its desktop entry, without ".desktop".
  const char* entry;
  /// What follows "org.mpris.MediaPlayer2." in its bus name, without the part for further instances.
  const char* busName;
  /// The class of its windows (the second part of WM_CLASS), in any case.
  const char* windowClass;
  std::uint8_t quirks;
};

std::span<const Program> programs();

/// The program with this desktop entry, bus name, window class; null when none has it. Entries are compared
/// without regard to case.
const Program* programByEntry(std::string_view entry);
const Program* programByBusName(std::string_view busName);
const Program* programByWindowClass(std::string_view windowClass);

/// Whether what owns this bus name plays no role whatever its entry says: proxies that speak for other
/// players, browsers, headsets.
bool isBystander(std::string_view busName);

}  // namespace desktop
