// The seven roles that programs of the desktop play.
#pragma once

#include <cstdint>
#include <string_view>

namespace linux::programs {

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

/// Every role but None.
inline constexpr Role kRoles[] = {
    Role::Jukebox,      Role::DiscPlayer,   Role::ClassicMovies,      Role::ModernMovies,
    Role::Presentation, Role::PhotoLibrary, Role::ProfessionalPhotos,
};

/// The bundle identifier that stands for a role; "" for None.
const char* bundleIdentifier(Role role);
/// The role behind a bundle identifier, compared exactly; None for any other text.
Role roleOf(std::string_view bundleIdentifier);

}  // namespace linux::programs
