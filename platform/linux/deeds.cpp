#include "platform/linux/deeds.h"

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

// clang-format off: one row a line, to be read beside the users' table.
constexpr Deed kDeeds[] = {
    // Music players.
    {Role::Jukebox, kOthers, lyrabox::kNextTrack, Means::Mpris, "Next"},

    // The disc player.

    // The classic movie player.

    // The modern movie player.

    // Presentations.

    // The photo library.

    // Professional photos.
};
// clang-format on

}  // namespace

std::span<const Deed> deeds() { return kDeeds; }

}  // namespace desktop
