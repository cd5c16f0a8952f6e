#include "platform/linux/roles/deeds.h"

#include "platform/linux/roles/own_words.h"
#include "platform/scripting/lyrabox_dictionary.h"
#include "platform/scripting/movie_dictionaries.h"
#include "platform/scripting/slidewell_dictionary.h"
#include "platform/scripting/snapvale_dictionary.h"
#include "platform/scripting/spindle_dictionary.h"

namespace desktop {

namespace {

namespace lyrabox = scripting::lyrabox;
namespace movies = scripting::movies;
namespace slidewell = scripting::slidewell;
namespace snapvale = scripting::snapvale;
namespace spindle = scripting::spindle;

// A row's program is its desktop entry; every other program of the role where there is none.
constexpr const char* kOthers = nullptr;

// One row a line, to be read beside the users' table.
// clang-format off
constexpr Deed kDeeds[] = {
    // Music players.
    {Role::Jukebox, kOthers, lyrabox::kPlayerState, Means::Code, "PlaybackStatus, or the direction of a scan"},
    {Role::Jukebox, kOthers, lyrabox::kPlayerPosition, Means::Code, "Position, SetPosition; in seconds"},
    {Role::Jukebox, kOthers, lyrabox::kSoundVolume, Means::Code, "Volume; 0 to 100"},
    {Role::Jukebox, kOthers, lyrabox::kCurrentTrack, Means::Code, "the one track there is"},
    {Role::Jukebox, kOthers, lyrabox::kName, Means::Code, "its title"},
    {Role::Jukebox, kOthers, lyrabox::kDuration, Means::Code, "its length in seconds"},
    {Role::Jukebox, kOthers, lyrabox::kPlay, Means::Code, "ends a scan and plays; other music players that play pause"},
    {Role::Jukebox, kOthers, lyrabox::kPause, Means::Code, "pauses what plays in this role, and ends a scan"},
    {Role::Jukebox, kOthers, lyrabox::kPlayPause, Means::Code, "pauses what plays or is scanned, else plays"},
    {Role::Jukebox, kOthers, lyrabox::kStop, Means::Code, "pauses what plays in this role, so that the place is kept"},
    {Role::Jukebox, kOthers, lyrabox::kResume, Means::Code, "ends a scan: what was paused before is paused again"},
    {Role::Jukebox, kOthers, lyrabox::kFastForward, Means::Code, "scans at 8 times the normal speed: seeks four times a second, to just before the end of the track"},
    {Role::Jukebox, kOthers, lyrabox::kRewind, Means::Code, "the same backward, to the beginning of the track"},
    {Role::Jukebox, kOthers, lyrabox::kNextTrack, Means::Mpris, "Next"},
    {Role::Jukebox, kOthers, lyrabox::kBackTrack, Means::Code, "goes to the beginning of a track that has played for more than 3 seconds, else Previous"},

    // The disc player.
    {Role::DiscPlayer, kOthers, spindle::kState, Means::Code, "PlaybackStatus; stopped while a menu shows, idle with nothing to play"},
    {Role::DiscPlayer, kOthers, spindle::kScanRate, Means::Code, "kept by kvd; setting it never fails"},
    {Role::DiscPlayer, "vlc", spindle::kChapter, Means::Rc, "chapter"},
    {Role::DiscPlayer, "vlc", spindle::kChapter, Means::Code, "without rc, or while paused, a disc goes one on or back by VLC's own keys; a file without chapters stands in chapter 2 where the play list has an entry before it and goes to that one, else in chapter 1; chapter 1 again is the beginning"},
    {Role::DiscPlayer, kOthers, spindle::kChapter, Means::Code, "2 where there is something to go back to, else 1; Next, Previous; chapter 1 again is the beginning"},
    {Role::DiscPlayer, "vlc", spindle::kAvailableChapters, Means::Rc, "chapter"},
    {Role::DiscPlayer, kOthers, spindle::kAvailableChapters, Means::Code, "one more than the chapter where there is something to go on to"},
    {Role::DiscPlayer, kOthers, spindle::kElapsedTime, Means::Code, "Position in the title, in seconds"},
    {Role::DiscPlayer, "vlc", spindle::kMenuActive, Means::Rc, "title"},
    {Role::DiscPlayer, kOthers, spindle::kActiveMenu, Means::Code, "main menu while a menu shows"},
    {Role::DiscPlayer, kOthers, spindle::kHasMedia, Means::Code, "whether something plays, is paused or stands in the play list"},
    {Role::DiscPlayer, kOthers, spindle::kAudioVolume, Means::Code, "Volume; 0 to 255"},
    {Role::DiscPlayer, kOthers, spindle::kAudioMuted, Means::Code, "fails: no way to ask for it or to change it"},
    {Role::DiscPlayer, kOthers, spindle::kDisplayingSubtitle, Means::Code, "fails: no way to ask for it"},
    {Role::DiscPlayer, kOthers, spindle::kControllerVisibility, Means::Code, "fails: players hide their controls by themselves"},
    {Role::DiscPlayer, kOthers, spindle::kViewerFullScreen, Means::Code, "Fullscreen"},
    {Role::DiscPlayer, kOthers, spindle::kPlayDVD, Means::Code, "plays at the normal rate; other disc players that play pause"},
    {Role::DiscPlayer, kOthers, spindle::kPauseDVD, Means::Code, "pauses what plays in this role, and ends a scan"},
    {Role::DiscPlayer, kOthers, spindle::kStopDVD, Means::Code, "Stop while a menu shows, else pauses what plays in this role"},
    {Role::DiscPlayer, kOthers, spindle::kFastForwardDVD, Means::Code, "plays at the scan rate: by Rate where the player has it, else by seeking; nothing while a menu shows"},
    {Role::DiscPlayer, kOthers, spindle::kRewindDVD, Means::Code, "the same backward, always by seeking"},
    {Role::DiscPlayer, "vlc", spindle::kGoToMainMenu, Means::Rc, "key key-disc-menu"},
    {Role::DiscPlayer, "vlc", spindle::kGoToMainMenu, Means::Key, "Shift+m"},
    {Role::DiscPlayer, "vlc", spindle::kGoReturn, Means::Code, "over rc: to where the film was left for the menu, else to the beginning of title 1"},
    {Role::DiscPlayer, kOthers, spindle::kGoToBeginning, Means::Code, "plays a disc anew; a file goes to its beginning"},
    {Role::DiscPlayer, "vlc", spindle::kPressUp, Means::Rc, "key key-nav-up"},
    {Role::DiscPlayer, "vlc", spindle::kPressUp, Means::Key, "Up"},
    {Role::DiscPlayer, "vlc", spindle::kPressDown, Means::Rc, "key key-nav-down"},
    {Role::DiscPlayer, "vlc", spindle::kPressDown, Means::Key, "Down"},
    {Role::DiscPlayer, "vlc", spindle::kPressLeft, Means::Rc, "key key-nav-left"},
    {Role::DiscPlayer, "vlc", spindle::kPressLeft, Means::Key, "Left"},
    {Role::DiscPlayer, "vlc", spindle::kPressRight, Means::Rc, "key key-nav-right"},
    {Role::DiscPlayer, "vlc", spindle::kPressRight, Means::Key, "Right"},
    {Role::DiscPlayer, "vlc", spindle::kPressEnter, Means::Rc, "key key-nav-activate"},
    {Role::DiscPlayer, "vlc", spindle::kPressEnter, Means::Key, "Return"},
    {Role::DiscPlayer, kOthers, spindle::kPressUp, Means::Key, "Up"},
    {Role::DiscPlayer, kOthers, spindle::kPressDown, Means::Key, "Down"},
    {Role::DiscPlayer, kOthers, spindle::kPressLeft, Means::Key, "Left"},
    {Role::DiscPlayer, kOthers, spindle::kPressRight, Means::Key, "Right"},
    {Role::DiscPlayer, kOthers, spindle::kPressEnter, Means::Key, "Return"},

    // The classic movie player.
    {Role::ClassicMovies, kOthers, movies::kName, Means::Code, "its title"},
    {Role::ClassicMovies, kOthers, movies::kRate, Means::Code, "0 pauses, 1 plays; others by Rate where the player has it, else by seeking four times a second"},
    {Role::ClassicMovies, kOthers, movies::kPlaying, Means::Code, "whether it plays or is scanned"},
    {Role::ClassicMovies, kOthers, movies::kVolume, Means::Code, "Volume; 0 to 256"},
    {Role::ClassicMovies, kOthers, movies::kCurrentTime, Means::Code, "Position, SetPosition; in seconds"},
    {Role::ClassicMovies, kOthers, movies::kDuration, Means::Code, "its length in seconds"},
    {Role::ClassicMovies, kOthers, movies::kViewerFullScreen, Means::Code, "Fullscreen"},
    {Role::ClassicMovies, kOthers, movies::kPlay, Means::Code, "plays at the normal rate; other classic movie players that play pause"},
    {Role::ClassicMovies, kOthers, movies::kPause, Means::Code, "pauses what plays in this role, and ends a scan"},
    {Role::ClassicMovies, kOthers, movies::kStop, Means::Code, "pauses what plays in this role, so that window, film and place are kept"},
    {Role::ClassicMovies, "mpv", movies::kStepForward, Means::Mpv, "frame-step"},
    {Role::ClassicMovies, "mpv", movies::kStepForward, Means::Key, "."},
    {Role::ClassicMovies, "mpv", movies::kStepBackward, Means::Mpv, "frame-back-step"},
    {Role::ClassicMovies, "mpv", movies::kStepBackward, Means::Key, ","},
    {Role::ClassicMovies, kOthers, movies::kStepForward, Means::Code, "seeks 10 seconds on"},
    {Role::ClassicMovies, kOthers, movies::kStepBackward, Means::Code, "seeks 10 seconds back"},
    {Role::ClassicMovies, kOthers, movies::kClose, Means::Mpris, "Stop"},

    // The modern movie player.
    {Role::ModernMovies, kOthers, movies::kName, Means::Code, "its title"},
    {Role::ModernMovies, kOthers, movies::kRate, Means::Code, "0 pauses, 1 plays; others by Rate where the player has it, else by seeking four times a second"},
    {Role::ModernMovies, kOthers, movies::kPlaying, Means::Code, "whether it plays or is scanned"},
    {Role::ModernMovies, kOthers, movies::kVolume, Means::Code, "Volume; 0 to 1"},
    {Role::ModernMovies, kOthers, movies::kCurrentTime, Means::Code, "Position, SetPosition; in seconds"},
    {Role::ModernMovies, kOthers, movies::kDuration, Means::Code, "its length in seconds"},
    {Role::ModernMovies, kOthers, movies::kPlay, Means::Code, "plays at the normal rate; other modern movie players that play pause"},
    {Role::ModernMovies, kOthers, movies::kPause, Means::Code, "pauses what plays in this role, and ends a scan"},
    {Role::ModernMovies, kOthers, movies::kStop, Means::Code, "pauses what plays in this role, so that window, film and place are kept"},
    {Role::ModernMovies, kOthers, movies::kStepForward, Means::Code, "seeks 10 seconds on"},
    {Role::ModernMovies, kOthers, movies::kStepBackward, Means::Code, "seeks 10 seconds back"},
    {Role::ModernMovies, kOthers, movies::kClose, Means::Mpris, "Stop"},
    {Role::ModernMovies, "io.github.celluloid_player.Celluloid", movies::kShowRemoteHUD, Means::Mpv, "show-text"},
    {Role::ModernMovies, "io.github.celluloid_player.Celluloid", movies::kShowRemoteHUD, Means::Code, "without it as any other"},
    {Role::ModernMovies, kOthers, movies::kShowRemoteHUD, Means::Code, "a desktop notification with title and time, which takes the place of the one before"},

    // Presentations.
    {Role::Presentation, "org.gnome.Evince", slidewell::kStart, Means::Action, "win.presentation"},
    {Role::Presentation, "org.kde.okular", slidewell::kStart, Means::Code, "`slotTogglePresentation` of Okular's own interface on the bus"},
    {Role::Presentation, "org.kde.okular", slidewell::kStart, Means::Key, "Control+Shift+p"},
    {Role::Presentation, kOthers, slidewell::kStart, Means::Key, "F5"},
    {Role::Presentation, kOthers, slidewell::kStop, Means::Key, "Escape"},
    {Role::Presentation, kOthers, slidewell::kShow, Means::Code, "the first slide: key Home; the last: key End; others fail"},
    {Role::Presentation, kOthers, slidewell::kShowNext, Means::Key, "Right"},
    {Role::Presentation, kOthers, slidewell::kShowPrevious, Means::Key, "Left"},
    {Role::Presentation, kOthers, slidewell::kShowSwitcher, Means::Code, "fails: no program has one"},
    {Role::Presentation, kOthers, slidewell::kAcceptSwitcher, Means::Code, "fails"},
    {Role::Presentation, kOthers, slidewell::kCancelSwitcher, Means::Code, "fails"},
    {Role::Presentation, kOthers, slidewell::kSwitcherForward, Means::Code, "fails"},
    {Role::Presentation, kOthers, slidewell::kSwitcherBackward, Means::Code, "fails"},
    {Role::Presentation, "libreoffice-impress", slidewell::kPlaying, Means::Code, "whether a full-screen window stands beside the document's"},
    {Role::Presentation, "org.kde.okular", slidewell::kPlaying, Means::Code, "whether a full-screen window stands beside the document's"},
    {Role::Presentation, kOthers, slidewell::kPlaying, Means::Code, "whether a window is full screen, and not by the action `win.fullscreen`"},
    {Role::Presentation, kOthers, slidewell::kFrozen, Means::Code, "key b, which takes the picture away; remembered until a step, a jump or the end of the show"},
    {Role::Presentation, kOthers, slidewell::kSwitcherVisible, Means::Code, "never"},
    {Role::Presentation, kOthers, slidewell::kName, Means::Code, "the title of the window"},

    // The photo library.
    {Role::PhotoLibrary, "org.gnome.eog", snapvale::kSlideshowRunning, Means::Code, "the state of the action `win.view-slideshow`"},
    {Role::PhotoLibrary, "org.gnome.gThumb", snapvale::kSlideshowRunning, Means::Code, "whether a full-screen window stands beside the ordinary one"},
    {Role::PhotoLibrary, "org.gnome.Shotwell", snapvale::kSlideshowRunning, Means::Code, "whether a full-screen window stands beside the ordinary one"},
    {Role::PhotoLibrary, kOthers, snapvale::kSlideshowRunning, Means::Code, "whether a window is full screen and the program is not Stopped as a player"},
    {Role::PhotoLibrary, "org.gnome.eog", snapvale::kStartSlideshow, Means::Action, "win.view-slideshow=true"},
    {Role::PhotoLibrary, "org.gnome.gThumb", snapvale::kStartSlideshow, Means::Action, "win.slideshow"},
    {Role::PhotoLibrary, "org.kde.gwenview", snapvale::kStartSlideshow, Means::Mpris, "Play"},
    {Role::PhotoLibrary, kOthers, snapvale::kStartSlideshow, Means::Key, "F5"},
    {Role::PhotoLibrary, "org.gnome.eog", snapvale::kStopSlideshow, Means::Action, "win.view-slideshow=false"},
    {Role::PhotoLibrary, "org.kde.gwenview", snapvale::kStopSlideshow, Means::Mpris, "Stop"},
    {Role::PhotoLibrary, kOthers, snapvale::kStopSlideshow, Means::Key, "Escape"},
    {Role::PhotoLibrary, kOthers, snapvale::kSelect, Means::Code, "goes to the next or the previous photo, as follows"},
    {Role::PhotoLibrary, "org.gnome.eog", words::kNextAlbum, Means::Action, "win.go-next"},
    {Role::PhotoLibrary, "org.gnome.eog", words::kPreviousAlbum, Means::Action, "win.go-previous"},
    {Role::PhotoLibrary, "org.gnome.gThumb", words::kNextAlbum, Means::Action, "win.show-next-image"},
    {Role::PhotoLibrary, "org.gnome.gThumb", words::kPreviousAlbum, Means::Action, "win.show-previous-image"},
    {Role::PhotoLibrary, "org.kde.gwenview", words::kNextAlbum, Means::Mpris, "Next"},
    {Role::PhotoLibrary, "org.kde.gwenview", words::kPreviousAlbum, Means::Mpris, "Previous"},
    {Role::PhotoLibrary, kOthers, words::kNextAlbum, Means::Key, "Right"},
    {Role::PhotoLibrary, kOthers, words::kPreviousAlbum, Means::Key, "Left"},
    {Role::PhotoLibrary, kOthers, snapvale::kCurrentAlbum, Means::Code, "the sixth of seven made up, so that it has a neighbour on either side"},
    {Role::PhotoLibrary, kOthers, snapvale::kName, Means::Code, "the number of an album"},
    {Role::PhotoLibrary, kOthers, snapvale::kID, Means::Code, "the number of an album"},
    {Role::PhotoLibrary, "org.gnome.eog", words::kSpace, Means::Action, "win.pause-slideshow"},
    {Role::PhotoLibrary, "org.kde.gwenview", words::kSpace, Means::Mpris, "PlayPause"},
    {Role::PhotoLibrary, "org.gnome.eog", words::kCommandEscape, Means::Action, "win.view-fullscreen"},
    {Role::PhotoLibrary, "org.gnome.gThumb", words::kCommandEscape, Means::Action, "win.fullscreen"},
    {Role::PhotoLibrary, kOthers, words::kCommandEscape, Means::Key, "F11"},

    // Professional photos.
    {Role::ProfessionalPhotos, "org.darktable.darktable", words::kShiftS, Means::Key, "s"},
    {Role::ProfessionalPhotos, "org.darktable.darktable", words::kReturn, Means::Key, "F11"},
    {Role::ProfessionalPhotos, "org.darktable.darktable", words::kEscape, Means::Key, "Escape F11"},
    {Role::ProfessionalPhotos, "org.kde.digikam", words::kShiftS, Means::Key, "F9"},
    {Role::ProfessionalPhotos, "org.kde.digikam", words::kReturn, Means::Nothing, "the show has begun"},
    {Role::ProfessionalPhotos, "rawtherapee", words::kShiftS, Means::Key, "F11"},
    {Role::ProfessionalPhotos, "rawtherapee", words::kReturn, Means::Nothing, "it has no shows, only the full screen"},
    {Role::ProfessionalPhotos, "rawtherapee", words::kSpace, Means::Nothing, "there is nothing to pause"},
    {Role::ProfessionalPhotos, "rawtherapee", words::kEscape, Means::Key, "F11"},
};
// clang-format on

}  // namespace

std::span<const Deed> deeds() { return kDeeds; }

}  // namespace desktop
