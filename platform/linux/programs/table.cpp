#include "platform/linux/programs/table.h"

#include <algorithm>
#include <iterator>

#include "platform/linux/programs/own_words.h"
#include "platform/scripting/lyrabox_dictionary.h"
#include "platform/scripting/movie_dictionaries.h"
#include "platform/scripting/slidewell_dictionary.h"
#include "platform/scripting/snapvale_dictionary.h"
#include "platform/scripting/spindle_dictionary.h"
#include "platform/text/case.h"

namespace linux::programs {

namespace {

using players::ChannelKind;
using players::kCountsMilliseconds;
using players::kIgnoresPlay;
using players::kIgnoresRaise;
using players::kIgnoresRate;
using players::kNeedsMedia;
using players::kSpeaksForBrowser;
using players::kStallsOnSeeks;

namespace lyrabox = scripting::lyrabox;
namespace movies = scripting::movies;
namespace slidewell = scripting::slidewell;
namespace snapvale = scripting::snapvale;
namespace spindle = scripting::spindle;

constexpr players::Quirks kBrowser = kNeedsMedia | kIgnoresRate;

// Within a role the first that is installed is the default. Those without a role take the remote themselves.
// One program a row, its actions one a line below it.
// clang-format off
constexpr Program kPrograms[] = {
    {.role = Role::Jukebox, .name = "Strawberry", .entry = "org.strawberrymusicplayer.strawberry", .busName = "strawberry", .windowClass = "strawberry", .quirks = kIgnoresRate | kIgnoresPlay | kStallsOnSeeks},
    {.role = Role::Jukebox, .name = "Rhythmbox", .entry = "org.gnome.Rhythmbox3", .busName = "rhythmbox", .windowClass = "rhythmbox", .quirks = kIgnoresRate | kIgnoresPlay | kStallsOnSeeks},
    {.role = Role::Jukebox, .name = "Elisa", .entry = "org.kde.elisa", .busName = "elisa", .windowClass = "elisa", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "Lollypop", .entry = "org.gnome.Lollypop", .busName = "Lollypop", .windowClass = "lollypop", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "Amberol", .entry = "io.bassi.Amberol", .busName = "Amberol", .windowClass = "io.bassi.Amberol", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "GNOME Music", .entry = "org.gnome.Music", .busName = "GnomeMusic", .windowClass = "org.gnome.Music", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "Clementine", .entry = "org.clementine_player.Clementine", .busName = "clementine", .windowClass = "clementine", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "Quod Libet", .entry = "io.github.quodlibet.QuodLibet", .busName = "quodlibet", .windowClass = "quodlibet", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "Audacious", .entry = "audacious", .busName = "audacious", .windowClass = "audacious", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "DeaDBeeF", .entry = "deadbeef", .busName = "DeaDBeeF", .windowClass = "deadbeef", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "Amarok", .entry = "org.kde.amarok", .busName = "amarok", .windowClass = "amarok", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "JuK", .entry = "org.kde.juk", .busName = "juk", .windowClass = "juk", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "Sayonara", .entry = "com.sayonara-player.Sayonara", .busName = "sayonara", .windowClass = "sayonara", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "Exaile", .entry = "exaile", .busName = "exaile", .windowClass = "exaile", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "Cantata", .entry = "org.kde.cantata", .busName = "cantata", .windowClass = "cantata", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "Spotify", .entry = "spotify", .busName = "spotify", .windowClass = "spotify", .quirks = kIgnoresRate},
    {.role = Role::Jukebox, .name = "cmus", .entry = "cmus", .busName = "cmus", .quirks = kIgnoresRate},

    {.role = Role::DiscPlayer, .name = "VLC", .entry = "vlc", .busName = "vlc", .windowClass = "vlc", .quirks = kIgnoresRaise, .channel = ChannelKind::VlcRc, .executable = "vlc",
     .actions = {{
         {spindle::kGoToMainMenu, Means::Channel, "key key-disc-menu"},
         {spindle::kGoToMainMenu, Means::Key, "Shift+m"},
         {spindle::kPressUp, Means::Channel, "key key-nav-up"},
         {spindle::kPressUp, Means::Key, "Up"},
         {spindle::kPressDown, Means::Channel, "key key-nav-down"},
         {spindle::kPressDown, Means::Key, "Down"},
         {spindle::kPressLeft, Means::Channel, "key key-nav-left"},
         {spindle::kPressLeft, Means::Key, "Left"},
         {spindle::kPressRight, Means::Channel, "key key-nav-right"},
         {spindle::kPressRight, Means::Key, "Right"},
         {spindle::kPressEnter, Means::Channel, "key key-nav-activate"},
         {spindle::kPressEnter, Means::Key, "Return"},
         {words::kNextChapter, Means::Key, "Shift+n"},
         {words::kPreviousChapter, Means::Key, "Shift+p"},
     }}},

    {.role = Role::ClassicMovies, .name = "mpv", .entry = "mpv", .busName = "mpv", .windowClass = "mpv", .quirks = kIgnoresRaise, .channel = ChannelKind::Mpv, .executable = "mpv",
     .actions = {{
         {movies::kStepForward, Means::Channel, "frame-step"},
         {movies::kStepForward, Means::Key, "."},
         {movies::kStepBackward, Means::Channel, "frame-back-step"},
         {movies::kStepBackward, Means::Key, ","},
     }}},
    {.role = Role::ClassicMovies, .name = "SMPlayer", .entry = "smplayer", .busName = "smplayer", .windowClass = "smplayer"},

    {.role = Role::ModernMovies, .name = "Celluloid", .entry = "io.github.celluloid_player.Celluloid", .busName = "io.github.celluloid_player.Celluloid", .windowClass = "celluloid", .channel = ChannelKind::Mpv, .executable = "celluloid"},
    {.role = Role::ModernMovies, .name = "Totem", .entry = "org.gnome.Totem", .busName = "totem", .windowClass = "totem", .quirks = kStallsOnSeeks},
    {.role = Role::ModernMovies, .name = "Haruna", .entry = "org.kde.haruna", .busName = "haruna", .windowClass = "haruna"},
    {.role = Role::ModernMovies, .name = "Clapper", .entry = "com.github.rafostar.Clapper", .busName = "Clapper", .windowClass = "com.github.rafostar.Clapper", .quirks = kStallsOnSeeks},
    {.role = Role::ModernMovies, .name = "Showtime", .entry = "org.gnome.Showtime", .busName = "org.gnome.Showtime", .windowClass = "org.gnome.Showtime", .quirks = kCountsMilliseconds},
    {.role = Role::ModernMovies, .name = "Dragon Player", .entry = "org.kde.dragonplayer", .busName = "dragonplayer", .windowClass = "dragonplayer"},
    {.role = Role::ModernMovies, .name = "Parole", .entry = "org.xfce.Parole", .busName = "parole", .windowClass = "parole"},
    // Browsers. Stop would take what they play away.
    {.role = Role::ModernMovies, .name = "Firefox", .entry = "firefox", .busName = "firefox", .windowClass = "firefox", .quirks = kBrowser, .actions = {{{movies::kClose, Means::Mpris, "Pause"}}}},
    {.role = Role::ModernMovies, .name = "Firefox ESR", .entry = "firefox-esr", .busName = "firefox", .windowClass = "firefox-esr", .quirks = kBrowser, .actions = {{{movies::kClose, Means::Mpris, "Pause"}}}},
    {.role = Role::ModernMovies, .name = "Chromium", .entry = "chromium", .busName = "chromium", .windowClass = "chromium", .quirks = kBrowser, .actions = {{{movies::kClose, Means::Mpris, "Pause"}}}},
    {.role = Role::ModernMovies, .name = "Chrome", .entry = "google-chrome", .busName = "chrome", .windowClass = "google-chrome", .quirks = kBrowser, .actions = {{{movies::kClose, Means::Mpris, "Pause"}}}},
    {.role = Role::ModernMovies, .name = "Brave", .entry = "brave-browser", .busName = "brave", .windowClass = "brave-browser", .quirks = kBrowser, .actions = {{{movies::kClose, Means::Mpris, "Pause"}}}},
    {.role = Role::ModernMovies, .name = "Vivaldi", .entry = "vivaldi-stable", .busName = "vivaldi", .windowClass = "vivaldi-stable", .quirks = kBrowser, .actions = {{{movies::kClose, Means::Mpris, "Pause"}}}},
    {.role = Role::ModernMovies, .name = "Opera", .entry = "opera", .busName = "opera", .windowClass = "opera", .quirks = kBrowser, .actions = {{{movies::kClose, Means::Mpris, "Pause"}}}},
    {.role = Role::ModernMovies, .name = "Edge", .entry = "microsoft-edge", .busName = "edge", .windowClass = "microsoft-edge", .quirks = kBrowser, .actions = {{{movies::kClose, Means::Mpris, "Pause"}}}},
    {.role = Role::ModernMovies, .name = "Web", .entry = "org.gnome.Epiphany", .busName = "org.gnome.Epiphany", .windowClass = "epiphany", .quirks = kBrowser, .actions = {{{movies::kClose, Means::Mpris, "Pause"}}}},
    {.role = Role::ModernMovies, .name = "Plasma Browser Integration", .busName = "plasma-browser-integration", .quirks = kBrowser | kSpeaksForBrowser, .actions = {{{movies::kClose, Means::Mpris, "Pause"}}}},

    {.role = Role::Presentation, .name = "LibreOffice Impress", .entry = "libreoffice-impress", .windowClass = "libreoffice-impress", .show = ShowStyle::OwnWindow, .suite = "libreoffice"},
    {.role = Role::Presentation, .name = "Evince", .entry = "org.gnome.Evince", .windowClass = "evince", .executable = "evince", .windowsAt = "/org/gnome/Evince/window",
     .actions = {{
         {slidewell::kStart, Means::Action, "win.presentation"},
         {slidewell::kStart, Means::Key, "F5"},
         {slidewell::kStop, Means::Action, "win.escape"},
         {slidewell::kStop, Means::Key, "Escape"},
     }}},
    {.role = Role::Presentation, .name = "Papers", .entry = "org.gnome.Papers", .windowClass = "papers", .executable = "papers", .windowsAt = "/org/gnome/Papers/window", .show = ShowStyle::ActionDisabled, .showAction = "win.fullscreen",
     .actions = {{
         {slidewell::kStart, Means::Action, "win.presentation"},
         {slidewell::kStop, Means::Action, "win.escape"},
     }}},
    {.role = Role::Presentation, .name = "Atril", .entry = "atril", .windowClass = "atril"},
    {.role = Role::Presentation, .name = "Okular", .entry = "org.kde.okular", .windowClass = "okular", .executable = "okular", .windowsAt = "/okular", .show = ShowStyle::OwnWindow,
     .actions = {{
         {slidewell::kStart, Means::Method, "org.kde.okular-% /okular org.kde.okular slotTogglePresentation"},
         {slidewell::kStart, Means::Key, "Control+Shift+p"},
         {slidewell::kStop, Means::Method, "org.kde.okular-% /okular org.kde.okular slotTogglePresentation"},
         {slidewell::kStop, Means::Key, "Escape"},
         {slidewell::kShowNext, Means::Method, "org.kde.okular-% /okular org.kde.okular slotNextPage"},
         {slidewell::kShowNext, Means::Key, "Right"},
         {slidewell::kShowPrevious, Means::Method, "org.kde.okular-% /okular org.kde.okular slotPreviousPage"},
         {slidewell::kShowPrevious, Means::Key, "Left"},
         {words::kFirstSlide, Means::Method, "org.kde.okular-% /okular org.kde.okular slotGotoFirst"},
         {words::kFirstSlide, Means::Key, "Home"},
         {words::kLastSlide, Means::Method, "org.kde.okular-% /okular org.kde.okular slotGotoLast"},
         {words::kLastSlide, Means::Key, "End"},
         {words::kThaw, Means::Key, "b"},
     }}},

    {.role = Role::PhotoLibrary, .name = "Eye of GNOME", .entry = "org.gnome.eog", .windowClass = "eog", .executable = "eog", .windowsAt = "/org/gnome/eog/window", .show = ShowStyle::ActionState, .showAction = "win.view-slideshow",
     .actions = {{
         {snapvale::kStartSlideshow, Means::Action, "win.view-slideshow=true"},
         {snapvale::kStartSlideshow, Means::Key, "F5"},
         {snapvale::kStopSlideshow, Means::Action, "win.view-slideshow=false"},
         {snapvale::kStopSlideshow, Means::Key, "Escape"},
         {words::kNextAlbum, Means::Action, "win.go-next"},
         {words::kNextAlbum, Means::Key, "Right"},
         {words::kPreviousAlbum, Means::Action, "win.go-previous"},
         {words::kPreviousAlbum, Means::Key, "Left"},
         {words::kRight, Means::Action, "win.go-next"},
         {words::kRight, Means::Key, "Right"},
         {words::kLeft, Means::Action, "win.go-previous"},
         {words::kLeft, Means::Key, "Left"},
         {words::kSpace, Means::Action, "win.pause-slideshow"},
         {words::kSpace, Means::Key, "p"},
         {words::kEscape, Means::Action, "win.view-slideshow=false"},
         {words::kEscape, Means::Key, "Escape"},
         {words::kCommandEscape, Means::Action, "win.view-fullscreen"},
         {words::kCommandEscape, Means::Key, "F11"},
     }}},
    {.role = Role::PhotoLibrary, .name = "gThumb", .entry = "org.gnome.gThumb", .windowClass = "gthumb", .executable = "gthumb", .windowsAt = "/org/gnome/gThumb/window", .show = ShowStyle::OwnWindow, .showAction = "win.slideshow-close",
     .actions = {{
         {snapvale::kStartSlideshow, Means::Action, "win.slideshow"},
         {snapvale::kStopSlideshow, Means::Action, "win.slideshow-close"},
         {snapvale::kStopSlideshow, Means::Key, "Escape"},
         {words::kNextAlbum, Means::Action, "win.show-next-image"},
         {words::kPreviousAlbum, Means::Action, "win.show-previous-image"},
         {words::kRight, Means::Action, "win.slideshow-next-image"},
         {words::kLeft, Means::Action, "win.slideshow-previous-image"},
         {words::kSpace, Means::Action, "win.slideshow-toggle-pause"},
         {words::kEscape, Means::Action, "win.slideshow-close"},
         {words::kEscape, Means::Key, "Escape"},
         {words::kCommandEscape, Means::Action, "win.fullscreen"},
     }}},
    {.role = Role::PhotoLibrary, .name = "Gwenview", .entry = "org.kde.gwenview", .busName = "Gwenview", .windowClass = "gwenview", .executable = "gwenview", .windowsAt = "/gwenview",
     .actions = {{
         {snapvale::kStartSlideshow, Means::Mpris, "Play"},
         {snapvale::kStartSlideshow, Means::Method, "% /gwenview/MainWindow_1 org.kde.KMainWindow activateAction toggle_slideshow"},
         {snapvale::kStopSlideshow, Means::Mpris, "Stop"},
         {snapvale::kStopSlideshow, Means::Method, "% /gwenview/MainWindow_1 org.kde.KMainWindow activateAction leave_fullscreen"},
         {words::kNextAlbum, Means::Mpris, "Next"},
         {words::kNextAlbum, Means::Method, "% /gwenview/MainWindow_1 org.kde.KMainWindow activateAction go_next"},
         {words::kPreviousAlbum, Means::Mpris, "Previous"},
         {words::kPreviousAlbum, Means::Method, "% /gwenview/MainWindow_1 org.kde.KMainWindow activateAction go_previous"},
         {words::kRight, Means::Mpris, "Next"},
         {words::kRight, Means::Method, "% /gwenview/MainWindow_1 org.kde.KMainWindow activateAction go_next"},
         {words::kLeft, Means::Mpris, "Previous"},
         {words::kLeft, Means::Method, "% /gwenview/MainWindow_1 org.kde.KMainWindow activateAction go_previous"},
         {words::kSpace, Means::Mpris, "PlayPause"},
         {words::kSpace, Means::Method, "% /gwenview/MainWindow_1 org.kde.KMainWindow activateAction toggle_slideshow"},
     }}},
    {.role = Role::PhotoLibrary, .name = "Shotwell", .entry = "org.gnome.Shotwell", .windowClass = "shotwell"},
    {.role = Role::PhotoLibrary, .name = "Loupe", .entry = "org.gnome.Loupe", .windowClass = "org.gnome.Loupe", .executable = "loupe", .windowsAt = "/org/gnome/Loupe/window",
     .actions = {{
         {snapvale::kStartSlideshow, Means::Key, "F11"},
     }}},

    {.role = Role::ProfessionalPhotos, .name = "darktable", .entry = "org.darktable.darktable", .windowClass = "darktable",
     .actions = {{
         {words::kShiftS, Means::Key, "s"},
         {words::kReturn, Means::Key, "F11"},
         {words::kEscape, Means::Key, "Escape F11"},
     }}},
    // Its show has begun when the second key comes.
    {.role = Role::ProfessionalPhotos, .name = "digiKam", .entry = "org.kde.digikam", .windowClass = "digikam",
     .actions = {{
         {words::kShiftS, Means::Key, "F9"},
         {words::kReturn, Means::Nothing},
     }}},
    // It has no shows, only the full screen, and nothing to pause.
    {.role = Role::ProfessionalPhotos, .name = "RawTherapee", .entry = "rawtherapee", .windowClass = "rawtherapee",
     .actions = {{
         {words::kShiftS, Means::Key, "F11"},
         {words::kReturn, Means::Nothing},
         {words::kSpace, Means::Nothing},
         {words::kEscape, Means::Key, "F11"},
     }}},

    {.takesRemote = true, .name = "Kodi", .entry = "kodi", .busName = "kodi", .windowClass = "kodi", .executable = "kodi.bin"},
    {.takesRemote = true, .name = "Kodi", .entry = "tv.kodi.Kodi", .windowClass = "tv.kodi.Kodi", .executable = "kodi.bin"},
    {.takesRemote = true, .name = "RetroArch", .entry = "retroarch", .windowClass = "retroarch", .executable = "retroarch"},
    {.takesRemote = true, .name = "RetroArch", .entry = "org.libretro.RetroArch", .windowClass = "com.libretro.RetroArch", .executable = "retroarch"},
    {.takesRemote = true, .name = "VDR", .windowClass = "vdr", .executable = "vdr"},
    {.takesRemote = true, .name = "MythTV", .entry = "mythtv", .windowClass = "mythfrontend", .executable = "mythfrontend"},
    {.takesRemote = true, .name = "MythTV", .entry = "mythfrontend", .windowClass = "mythfrontend.real", .executable = "mythfrontend.real"},
    {.takesRemote = true, .name = "Jellyfin Media Player", .entry = "com.github.iwalton3.jellyfin-media-player", .windowClass = "jellyfinmediaplayer", .executable = "jellyfinmediaplayer"},
    {.takesRemote = true, .name = "Jellyfin Desktop", .entry = "org.jellyfin.JellyfinDesktop", .windowClass = "org.jellyfin.JellyfinDesktop", .executable = "jellyfin-desktop"},
    {.takesRemote = true, .name = "Plex HTPC", .entry = "tv.plex.PlexHTPC", .windowClass = "Plex HTPC", .executable = "Plex HTPC"},
    {.takesRemote = true, .name = "Plex", .entry = "tv.plex.PlexDesktop", .windowClass = "Plex", .executable = "Plex"},
};

constexpr Action kJukebox[] = {
    {lyrabox::kNextTrack, Means::Mpris, "Next"},
};

constexpr Action kDiscPlayer[] = {
    {spindle::kPressUp, Means::Key, "Up"},
    {spindle::kPressDown, Means::Key, "Down"},
    {spindle::kPressLeft, Means::Key, "Left"},
    {spindle::kPressRight, Means::Key, "Right"},
    {spindle::kPressEnter, Means::Key, "Return"},
};

constexpr Action kMovies[] = {
    {movies::kClose, Means::Mpris, "Stop"},
};

constexpr Action kPresentation[] = {
    {slidewell::kStart, Means::Key, "F5"},
    {slidewell::kStop, Means::Key, "Escape"},
    {slidewell::kShowNext, Means::Key, "Right"},
    {slidewell::kShowPrevious, Means::Key, "Left"},
    {words::kFirstSlide, Means::Key, "Home"},
    {words::kLastSlide, Means::Key, "End"},
    {words::kFreeze, Means::Key, "b"},
};

constexpr Action kPhotoLibrary[] = {
    {snapvale::kStartSlideshow, Means::Key, "F5"},
    {snapvale::kStopSlideshow, Means::Key, "Escape"},
    {words::kNextAlbum, Means::Key, "Right"},
    {words::kPreviousAlbum, Means::Key, "Left"},
    {words::kCommandEscape, Means::Key, "F11"},
};
// clang-format on

/// Beginnings of bus names, after the prefix of all players.
constexpr std::string_view kBystanders[] = {
    "playerctld",
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

std::span<const Program> programs() { return kPrograms; }

const Program* programByEntry(std::string_view entry) { return programBy(&Program::entry, entry); }

const Program* programByBusName(std::string_view busName) {
  return programBy(&Program::busName, withoutInstance(busName));
}

const Program* programByWindowClass(std::string_view windowClass) {
  return programBy(&Program::windowClass, windowClass);
}

const Program* programByExecutable(std::string_view executable) {
  const auto* const found = std::find_if(std::begin(kPrograms), std::end(kPrograms), [&](const Program& row) {
    return *row.windowsAt != '\0' && row.executable == executable;
  });
  return found != std::end(kPrograms) ? found : nullptr;
}

bool isOfSuite(std::string_view windowClass) {
  return std::any_of(std::begin(kPrograms), std::end(kPrograms), [&](const Program& row) {
    return *row.suite != '\0' && windowClass.starts_with(row.suite);
  });
}

bool isBystander(std::string_view busName) {
  return std::any_of(std::begin(kBystanders), std::end(kBystanders),
                     [&](std::string_view beginning) { return busName.starts_with(beginning); });
}

std::span<const Action> commonActions(Role role) {
  switch (role) {
    case Role::Jukebox:
      return kJukebox;
    case Role::DiscPlayer:
      return kDiscPlayer;
    case Role::ClassicMovies:
    case Role::ModernMovies:
      return kMovies;
    case Role::Presentation:
      return kPresentation;
    case Role::PhotoLibrary:
      return kPhotoLibrary;
    case Role::ProfessionalPhotos:
    case Role::None:
      break;
  }
  return {};
}

bool hasOwnAction(const Program* program, tarnscript::Code word) {
  return program != nullptr &&
         std::ranges::find(program->actions, word, &Action::word) != program->actions.end();
}

std::vector<Action> actionsFor(Role role, const Program* program, tarnscript::Code word) {
  const std::span<const Action> rows =
      hasOwnAction(program, word) ? std::span<const Action>(program->actions) : commonActions(role);
  std::vector<Action> found;
  std::ranges::copy_if(rows, std::back_inserter(found),
                       [&](const Action& action) { return action.word == word; });
  return found;
}

}  // namespace linux::programs
