#include "platform/linux/roles/world.h"

#include "platform/linux/roles/additions.h"
#include "platform/linux/roles/disc_player.h"
#include "platform/linux/roles/jukebox.h"
#include "platform/linux/roles/keyhouse.h"
#include "platform/linux/roles/movies.h"
#include "platform/linux/roles/photo_library.h"
#include "platform/linux/roles/presentation.h"
#include "platform/tarnscript/text.h"

namespace linux::roles {

namespace {

struct Row {
  const char* identifier;
  const char* name;
  tarnscript::Application& (*application)();
};

constexpr Row kApplications[] = {
    {"com.tarn.Lyrabox", "Lyrabox", jukebox},
    {"com.tarn.Spindle", "Spindle", discPlayer},
    {"com.tarn.vistremeplayer", "VistremePlayer", classicMovies},
    {"com.tarn.VistremePlayerX", "VistremePlayerX", modernMovies},
    {"com.tarn.Officra.Slidewell", "Slidewell", presentation},
    {"com.tarn.Snapvale", "Snapvale", photoLibrary},
    {"com.tarn.Keyhouse", "Keyhouse", keyhouse},
};

class World final : public tarnscript::World {
 public:
  tarnscript::Application* find(std::string_view identifierOrName) override;
  tarnscript::Application& additions() override { return roles::additions(); }
};

tarnscript::Application* World::find(std::string_view identifierOrName) {
  for (const Row& row : kApplications) {
    if (identifierOrName == row.identifier || identifierOrName == row.name) return &row.application();
  }
  for (const Row& row : kApplications) {
    if (tarnscript::equalIgnoringCase(identifierOrName, row.identifier) ||
        tarnscript::equalIgnoringCase(identifierOrName, row.name)) {
      return &row.application();
    }
  }
  return nullptr;
}

}  // namespace

tarnscript::World& world() {
  static World instance;
  return instance;
}

}  // namespace linux::roles
