#include "platform/linux/windows/kwin/desktops.h"

#include <wayland-client.h>

#include <algorithm>
#include <cstdint>
#include <memory>
#include <vector>

#include "plasma_virtual_desktop.h"

namespace linux::windows::kwin {

namespace {

struct Desktop {
  std::string id;
  org_kde_plasma_virtual_desktop* proxy = nullptr;
  bool isShown = false;
};

org_kde_plasma_virtual_desktop_management* sManager = nullptr;
std::vector<std::unique_ptr<Desktop>> sDesktops;

constexpr org_kde_plasma_virtual_desktop_listener kDesktopListener{
    .desktop_id = [](void*, auto*, const char*) {},
    .name = [](void*, auto*, const char*) {},
    .activated = [](void* data, auto*) { static_cast<Desktop*>(data)->isShown = true; },
    .deactivated = [](void* data, auto*) { static_cast<Desktop*>(data)->isShown = false; },
    .done = [](void*, auto*) {},
    .removed = [](void*, auto*) {},
};

void add(void*, org_kde_plasma_virtual_desktop_management*, const char* id, std::uint32_t) {
  auto* const proxy = org_kde_plasma_virtual_desktop_management_get_virtual_desktop(sManager, id);
  const auto& desktop = sDesktops.emplace_back(new Desktop{id, proxy});
  org_kde_plasma_virtual_desktop_add_listener(proxy, &kDesktopListener, desktop.get());
}

void remove(void*, org_kde_plasma_virtual_desktop_management*, const char* id) {
  const auto gone = std::ranges::find(sDesktops, id, [](const auto& each) { return each->id; });
  if (gone == sDesktops.end()) return;
  org_kde_plasma_virtual_desktop_destroy((*gone)->proxy);
  sDesktops.erase(gone);
}

constexpr org_kde_plasma_virtual_desktop_management_listener kListener{
    .desktop_created = add,
    .desktop_removed = remove,
    .done = [](void*, auto*) {},
    .rows = [](void*, auto*, std::uint32_t) {},
};

}  // namespace

void takeDesktops(const wayland::Offer& offer) {
  if (sManager != nullptr) return;
  sManager = static_cast<org_kde_plasma_virtual_desktop_management*>(
      wayland::accept(offer, org_kde_plasma_virtual_desktop_management_interface, 2));
  org_kde_plasma_virtual_desktop_management_add_listener(sManager, &kListener, nullptr);
}

void dropDesktops() {
  for (const auto& desktop : sDesktops) org_kde_plasma_virtual_desktop_destroy(desktop->proxy);
  sDesktops.clear();
  if (sManager != nullptr) org_kde_plasma_virtual_desktop_management_destroy(sManager);
  sManager = nullptr;
}

bool isAnyShown(std::span<const std::string> desktops) {
  if (desktops.empty() || sDesktops.empty()) return true;
  return std::ranges::any_of(sDesktops, [&](const auto& each) {
    return each->isShown && std::ranges::find(desktops, each->id) != desktops.end();
  });
}

}  // namespace linux::windows::kwin
