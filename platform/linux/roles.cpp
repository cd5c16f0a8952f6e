#include "platform/linux/roles.h"

#include <algorithm>

#include "platform/scripting/identity.h"
#include "platform/text/case.h"

namespace desktop {

namespace {

struct RoleRow {
  Role role;
  const char* bundleIdentifier;
};

constexpr RoleRow kRoles[] = {
    {Role::Jukebox, scripting::kLyrabox.identifier},
    {Role::DiscPlayer, scripting::kSpindle.identifier},
    {Role::ClassicMovies, scripting::kVistremePlayer.identifier},
    {Role::ModernMovies, scripting::kVistremePlayerX.identifier},
    {Role::Presentation, scripting::kSlidewell.identifier},
    {Role::PhotoLibrary, scripting::kSnapvale.identifier},
    {Role::ProfessionalPhotos, scripting::kLumbra.identifier},
};

// clang-format off: one program a line. Within a role the first that is installed is the default.
constexpr Program kPrograms[] = {
    {Role::Jukebox, "Strawberry", "org.strawberrymusicplayer.strawberry", "strawberry", "strawberry",
     kIgnoresRate},
    {Role::Jukebox, "Rhythmbox", "org.gnome.Rhythmbox3", "rhythmbox", "rhythmbox", kIgnoresRate},
    {Role::Jukebox, "Elisa", "org.kde.elisa", "elisa", "elisa", kIgnoresRate},
    {Role::Jukebox, "Lollypop", "org.gnome.Lollypop", "Lollypop", "lollypop", kIgnoresRate},
    {Role::Jukebox, "Amberol", "io.bassi.Amberol", "Amberol", "io.bassi.Amberol", kIgnoresRate},
    {Role::Jukebox, "GNOME Music", "org.gnome.Music", "GnomeMusic", "org.gnome.Music", kIgnoresRate},
    {Role::Jukebox, "Clementine", "org.clementine_player.Clementine", "clementine", "clementine",
     kIgnoresRate},
    {Role::Jukebox, "Quod Libet", "io.github.quodlibet.QuodLibet", "quodlibet", "quodlibet", kIgnoresRate},
    {Role::Jukebox, "Audacious", "audacious", "audacious", "audacious", kIgnoresRate},
    {Role::Jukebox, "DeaDBeeF", "deadbeef", "DeaDBeeF", "deadbeef", kIgnoresRate},
    {Role::Jukebox, "Amarok", "org.kde.amarok", "amarok", "amarok", kIgnoresRate},
    {Role::Jukebox, "JuK", "org.kde.juk", "juk", "juk", kIgnoresRate},
    {Role::Jukebox, "Sayonara", "com.sayonara-player.Sayonara", "sayonara", "sayonara", kIgnoresRate},
    {Role::Jukebox, "Exaile", "exaile", "exaile", "exaile", kIgnoresRate},
    {Role::Jukebox, "Cantata", "org.kde.cantata", "cantata", "cantata", kIgnoresRate},
    {Role::Jukebox, "Spotify", "spotify", "spotify", "spotify", kIgnoresRate},
    {Role::Jukebox, "cmus", "cmus", "cmus", "", kIgnoresRate},
    {Role::DiscPlayer, "VLC", "vlc", "vlc", "vlc", kIgnoresRaise},
    {Role::ClassicMovies, "mpv", "mpv", "mpv", "mpv", kIgnoresRaise},
    {Role::ClassicMovies, "SMPlayer", "smplayer", "smplayer", "smplayer", kNoQuirk},
    {Role::ModernMovies, "Celluloid", "io.github.celluloid_player.Celluloid",
     "io.github.celluloid_player.Celluloid", "celluloid", kNoQuirk},
    {Role::ModernMovies, "Totem", "org.gnome.Totem", "totem", "totem", kNoQuirk},
    {Role::ModernMovies, "Haruna", "org.kde.haruna", "haruna", "haruna", kNoQuirk},
    {Role::ModernMovies, "Clapper", "com.github.rafostar.Clapper", "Clapper", "com.github.rafostar.Clapper",
     kNoQuirk},
    {Role::ModernMovies, "Showtime", "org.gnome.Showtime", "Showtime", "org.gnome.Showtime", kNoQuirk},
    {Role::ModernMovies, "Dragon Player", "org.kde.dragonplayer", "dragonplayer", "dragonplayer", kNoQuirk},
    {Role::ModernMovies, "Parole", "org.xfce.Parole", "parole", "parole", kNoQuirk},
    {Role::Presentation, "LibreOffice Impress", "libreoffice-impress", "", "libreoffice-impress", kNoQuirk},
    {Role::Presentation, "Evince", "org.gnome.Evince", "", "evince", kNoQuirk},
    {Role::Presentation, "Okular", "org.kde.okular", "", "okular", kNoQuirk},
    {Role::PhotoLibrary, "Eye of GNOME", "org.gnome.eog", "", "eog", kNoQuirk},
    {Role::PhotoLibrary, "gThumb", "org.gnome.gThumb", "", "gthumb", kNoQuirk},
    {Role::PhotoLibrary, "Gwenview", "org.kde.gwenview", "Gwenview", "gwenview", kNoQuirk},
    {Role::PhotoLibrary, "Shotwell", "org.gnome.Shotwell", "", "shotwell", kNoQuirk},
    {Role::PhotoLibrary, "Loupe", "org.gnome.Loupe", "", "org.gnome.Loupe", kNoQuirk},
    {Role::ProfessionalPhotos, "darktable", "org.darktable.darktable", "", "darktable", kNoQuirk},
    {Role::ProfessionalPhotos, "digiKam", "org.kde.digikam", "", "digikam", kNoQuirk},
    {Role::ProfessionalPhotos, "RawTherapee", "rawtherapee", "", "rawtherapee", kNoQuirk},
};
// clang-format on

/// Beginnings of bus names, after the prefix of all players.
constexpr std::string_view kBystanders[] = {
    "playerctld",
    "firefox",
    "chromium",
    "chrome",
    "brave",
    "vivaldi",
    "opera",
    "epiphany",
    "org.gnome.Epiphany",
    "edge",
    "plasma-browser-integration",
    "kdeconnect",
};

const Program* programBy(const char* Program::*name, std::string_view value) {
  if (value.empty()) return nullptr;
  const auto* const found = std::find_if(std::begin(kPrograms), std::end(kPrograms), [&](const Program& row) {
    return text::equalIgnoringCase(row.*name, value);
  });
  return found != std::end(kPrograms) ? found : nullptr;
}

/// Without the part that tells further instances of a program apart: "mpv.instance42", "vlc.instance42",
/// "….Celluloid.instance-1".
std::string_view withoutInstance(std::string_view busName) {
  return busName.substr(0, busName.find(".instance"));
}

}  // namespace

const char* bundleIdentifier(Role role) {
  for (const RoleRow& row : kRoles) {
    if (row.role == role) return row.bundleIdentifier;
  }
  return "";
}

Role roleOf(std::string_view identifier) {
  for (const RoleRow& row : kRoles) {
    if (row.bundleIdentifier == identifier) return row.role;
  }
  return Role::None;
}

std::span<const Program> programs() { return kPrograms; }

const Program* programByEntry(std::string_view entry) { return programBy(&Program::entry, entry); }

const Program* programByBusName(std::string_view busName) {
  return programBy(&Program::busName, withoutInstance(busName));
}

const Program* programByWindowClass(std::string_view windowClass) {
  return programBy(&Program::windowClass, windowClass);
}

bool isBystander(std::string_view busName) {
  return std::any_of(std::begin(kBystanders), std::end(kBystanders),
                     [&](std::string_view beginning) { return busName.starts_with(beginning); });
}

}  // namespace desktop
