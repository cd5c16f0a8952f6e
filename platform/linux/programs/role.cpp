#include "platform/linux/programs/role.h"

namespace linux::programs {

namespace {

struct RoleRow {
  Role role;
  const char* bundleIdentifier;
};

constexpr RoleRow kIdentifiers[] = {
    {Role::Jukebox, "com.tarn.Lyrabox"},
    {Role::DiscPlayer, "com.tarn.Spindle"},
    {Role::ClassicMovies, "com.tarn.vistremeplayer"},
    {Role::ModernMovies, "com.tarn.VistremePlayerX"},
    {Role::Presentation, "com.tarn.Officra.Slidewell"},
    {Role::PhotoLibrary, "com.tarn.Snapvale"},
    {Role::ProfessionalPhotos, "com.tarn.Lumbra"},
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
