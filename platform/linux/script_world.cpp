#include "platform/linux/script_world.h"

#include <iterator>

#include "platform/linux/additions.h"
#include "platform/linux/role_application.h"
#include "platform/scripting/identity.h"
#include "platform/scripting/script.h"

namespace desktop {

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
  tarnscript::Application& additions() override { return desktop::additions(); }
};

tarnscript::Application* World::find(std::string_view identifierOrName) {
  const auto* const row = scripting::findNamed(kApplications, identifierOrName, &Row::identity);
  return row != std::end(kApplications) ? &row->application() : nullptr;
}

}  // namespace

void letScriptsFindRoles() {
  static World world;
  scripting::setHooks({&world, nullptr, nullptr});
}

}  // namespace desktop
