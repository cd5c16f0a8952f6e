#include "platform/terminal/catalogue.h"

namespace terminal {

namespace {

struct Role {
  AppCode code;
  std::string_view identifier;
  std::string_view role;
};

constexpr Role kRoles[] = {
    {App::Lyra, Bundle::Lyrabox, "music jukebox"},
    {App::Spin, Bundle::Spindle, "disc player"},
    {App::Vist, Bundle::VistremePlayer, "classic movie player"},
    {App::VstX, Bundle::VistremePlayerX, "modern movie player"},
    {App::Slid, Bundle::Slidewell, "presentations"},
    {App::Snap, Bundle::Snapvale, "photo library"},
    {App::Lumb, Bundle::Lumbra, "professional photos"},
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

const stage::Application* applicationOf(AppCode code) {
  for (const Role& row : kRoles) {
    if (row.code == code) return stage::findApplication(row.identifier);
  }
  return nullptr;
}

}  // namespace terminal
