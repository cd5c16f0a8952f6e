#include "platform/linux/programs/role.h"

#include "platform/scripting/identity.h"

namespace linux::programs {

namespace {

struct RoleRow {
  Role role;
  const char* bundleIdentifier;
};

constexpr RoleRow kIdentifiers[] = {
    {Role::Jukebox, scripting::kLyrabox.identifier},
    {Role::DiscPlayer, scripting::kSpindle.identifier},
    {Role::ClassicMovies, scripting::kVistremePlayer.identifier},
    {Role::ModernMovies, scripting::kVistremePlayerX.identifier},
    {Role::Presentation, scripting::kSlidewell.identifier},
    {Role::PhotoLibrary, scripting::kSnapvale.identifier},
    {Role::ProfessionalPhotos, scripting::kLumbra.identifier},
};

}  // namespace

const char* bundleIdentifier(Role role) {
  for (const RoleRow& row : kIdentifiers) {
    if (row.role == role) return row.bundleIdentifier;
  }
  return "";
}

Role roleOf(std::string_view identifier) {
  for (const RoleRow& row : kIdentifiers) {
    if (row.bundleIdentifier == identifier) return row.role;
  }
  return Role::None;
}

}  // namespace linux::programs
