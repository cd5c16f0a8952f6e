#include "platform/linux/windows/wayland/outputs.h"

#include <wayland-client.h>

#include <algorithm>
#include <memory>
#include <string>

#include "platform/linux/windows/wayland/toplevels.h"

namespace linux::windows::wayland {

namespace {

struct Known {
  wl_output* proxy = nullptr;
  Output output;
  /// Where the compositor has it.
  int x = 0;
  int y = 0;
  std::string name;
};

std::vector<std::unique_ptr<Known>> sOutputs;

void setMode(void* data, wl_output*, std::uint32_t flags, std::int32_t width, std::int32_t height,
             std::int32_t) {
  if ((flags & WL_OUTPUT_MODE_CURRENT) == 0) return;
  static_cast<Known*>(data)->output.area = {0, 0, width, height};
  int left = 0;
  for (const auto& known : sOutputs) {
    known->output.area.x = left;
    left += known->output.area.width;
  }
}

void setPlace(void* data, wl_output*, std::int32_t x, std::int32_t y, std::int32_t, std::int32_t,
              std::int32_t, const char*, const char*, std::int32_t) {
  static_cast<Known*>(data)->x = x;
  static_cast<Known*>(data)->y = y;
}

constexpr wl_output_listener kListener{
    .geometry = setPlace,
    .mode = setMode,
    .done = [](void*, auto*) {},
    .scale = [](void*, auto*, int) {},
    .name = [](void* data, auto*, const char* name) { static_cast<Known*>(data)->name = name; },
    .description = [](void*, auto*, const char*) {},
};

void destroy(const Known& known) {
  leaveOutput(known.proxy);
  if (wl_output_get_version(known.proxy) >= WL_OUTPUT_RELEASE_SINCE_VERSION) {
    wl_output_release(known.proxy);
  } else {
    wl_output_destroy(known.proxy);
  }
}

}  // namespace

void addOutput(const Offer& offer) {
  auto* const proxy = static_cast<wl_output*>(accept(offer, wl_output_interface, 4));
  const auto& known = sOutputs.emplace_back(new Known{proxy, {offer.name, {}}, 0, 0, {}});
  wl_output_add_listener(proxy, &kListener, known.get());
}

void removeOutput(std::uint32_t name) {
  const auto gone = std::ranges::find(sOutputs, name, [](const auto& known) { return known->output.id; });
  if (gone == sOutputs.end()) return;
  destroy(**gone);
  sOutputs.erase(gone);
}

void forgetOutputs() {
  for (const auto& known : sOutputs) destroy(*known);
  sOutputs.clear();
}

std::vector<Output> outputs() {
  std::vector<Output> sized;
  for (const auto& known : sOutputs) {
    if (known->output.area.width > 0) sized.push_back(known->output);
  }
  return sized;
}

Area areaOf(std::span<wl_output* const> entered) {
  Area area;
  for (const auto& known : sOutputs) {
    if (std::ranges::find(entered, known->proxy) == entered.end()) continue;
    const Area& covered = known->output.area;
    if (area.width == 0) area.x = covered.x;
    area.width = covered.x + covered.width - area.x;
    area.height = std::max(area.height, covered.height);
  }
  return area;
}

Area areaAt(int x, int y) {
  const auto there =
      std::ranges::find_if(sOutputs, [&](const auto& known) { return known->x == x && known->y == y; });
  return there != sOutputs.end() ? (*there)->output.area : Area{};
}

Area areaOf(std::string_view name) {
  const auto named = std::ranges::find(sOutputs, name, [](const auto& known) { return known->name; });
  return named != sOutputs.end() ? (*named)->output.area : Area{};
}

}  // namespace linux::windows::wayland
