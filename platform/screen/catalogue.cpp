#include "platform/screen/catalogue.h"

#include "daemon/kvd.h"

namespace live {

namespace {

struct Role {
  std::string_view identifier;
  std::string_view role;
};

constexpr Role kRoles[] = {
    {Bundle::Lyrabox, "music jukebox"},
    {Bundle::Spindle, "disc player"},
    {Bundle::VistremePlayer, "classic movie player"},
    {Bundle::VistremePlayerX, "modern movie player"},
    {Bundle::Slidewell, "presentations"},
    {Bundle::Snapvale, "photo library"},
    {Bundle::Lumbra, "professional photos"},
};

}  // namespace

std::vector<const stage::Application*> openable(const stage::Desktop& desktop) {
  std::vector<const stage::Application*> applications;
  for (const auto& application : desktop.installed) {
    const bool isHelper = application->running() && application->instances.empty();
    if (!isHelper) applications.push_back(application.get());
  }
  return applications;
}

std::string_view roleOf(const stage::Application& application) {
  for (const Role& row : kRoles) {
    if (row.identifier == application.identifier) return row.role;
  }
  return {};
}

}  // namespace live
