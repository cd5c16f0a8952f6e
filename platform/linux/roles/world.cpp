#include "platform/linux/roles/world.h"

#include <iterator>

#include "platform/linux/roles/additions.h"
#include "platform/linux/roles/disc_player.h"
#include "platform/linux/roles/jukebox.h"
#include "platform/linux/roles/keyhouse.h"
#include "platform/linux/roles/movies.h"
#include "platform/linux/roles/photo_library.h"
#include "platform/linux/roles/presentation.h"
#include "platform/scripting/identity.h"

namespace linux::roles {

namespace {

struct Row {
  scripting::Identity identity;
  tarnscript::Application& (*application)();
};

constexpr Row kApplications[] = {
    {scripting::kLyrabox, jukebox},
    {scripting::kSpindle, discPlayer},
    {scripting::kVistremePlayer, classicMovies},
    {scripting::kVistremePlayerX, modernMovies},
    {scripting::kSlidewell, presentation},
    {scripting::kSnapvale, photoLibrary},
    {scripting::kKeyhouse, keyhouse},
};

class World final : public tarnscript::World {
 public:
  tarnscript::Application* find(std::string_view identifierOrName) override;
  tarnscript::Application& additions() override { return roles::additions(); }
};

tarnscript::Application* World::find(std::string_view identifierOrName) {
  const auto* const row = scripting::findNamed(kApplications, identifierOrName, &Row::identity);
  return row != std::end(kApplications) ? &row->application() : nullptr;
}

}  // namespace

tarnscript::World& world() {
  static World instance;
  return instance;
}

}  // namespace linux::roles
