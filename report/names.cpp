#include "report/names.h"

#include <algorithm>
#include <iterator>

namespace report {

namespace {

using linux::programs::Role;

struct RoleRow {
  Role role;
  AppCode code;
  std::string_view words;
};

constexpr RoleRow kRoles[] = {
    {Role::Jukebox, App::Lyra, "music player"},
    {Role::DiscPlayer, App::Spin, "disc player"},
    {Role::ClassicMovies, App::Vist, "classic movie player"},
    {Role::ModernMovies, App::VstX, "modern movie player"},
    {Role::Presentation, App::Slid, "presentations"},
    {Role::PhotoLibrary, App::Snap, "photo library"},
    {Role::ProfessionalPhotos, App::Lumb, "professional photos"},
};

struct KeyRow {
  std::uint16_t virtualKey;
  std::string_view name;
};

constexpr KeyRow kKeys[] = {
    {HostVirtualKey::S, "S"},
    {HostVirtualKey::Return, "Return"},
    {HostVirtualKey::Tab, "Tab"},
    {HostVirtualKey::Space, "Space"},
    {HostVirtualKey::Escape, "Escape"},
    {HostVirtualKey::LeftArrow, "Left"},
    {HostVirtualKey::RightArrow, "Right"},
    {HostVirtualKey::DownArrow, "Down"},
    {HostVirtualKey::UpArrow, "Up"},
};

}  // namespace

std::string nameOf(const linux::programs::Instance& instance) {
  if (instance.program != nullptr) return instance.program->name;
  if (!instance.entry.empty()) return instance.entry;
  const auto* const player = linux::programs::playerOf(instance);
  return player != nullptr ? player->name : "a program without a name";
}

std::string_view wordsFor(Role role) {
  const auto* const row = std::ranges::find(kRoles, role, &RoleRow::role);
  return row != std::end(kRoles) ? row->words : "";
}

Role roleOf(AppCode code) {
  const auto* const row = std::ranges::find(kRoles, code, &RoleRow::code);
  return row != std::end(kRoles) ? row->role : Role::None;
}

std::string keyName(std::uint16_t virtualKey, bool withShift) {
  const auto* const row = std::ranges::find(kKeys, virtualKey, &KeyRow::virtualKey);
  const std::string name = row != std::end(kKeys) ? std::string(row->name) : std::to_string(virtualKey);
  return withShift ? "Shift+" + name : name;
}

}  // namespace report
