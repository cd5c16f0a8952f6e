#include "platform/linux/windows/cosmic/toplevel_info.h"

#include <wayland-client.h>

#include <algorithm>
#include <cstdint>
#include <span>
#include <vector>

#include "cosmic_toplevels.h"
#include "platform/linux/windows/wayland/toplevels.h"

namespace linux::windows::cosmic {

namespace {

using wayland::Description;
using wayland::Toplevel;

/// The first version that goes by the list's windows, and the one that is described here.
constexpr std::uint32_t kVersion = 2;

wayland::Offer sListOffer;
wayland::Offer sInfoOffer;
ext_foreign_toplevel_list_v1* sList = nullptr;
zcosmic_toplevel_info_v1* sInfo = nullptr;
bool sAllAreKnown = false;

Toplevel& self(void* data) { return *static_cast<Toplevel*>(data); }

template <typename... Arguments>
void ignore(void*, Arguments...) {}

void setState(void* data, zcosmic_toplevel_handle_v1*, wl_array* states) {
  const std::span values(static_cast<const std::uint32_t*>(states->data),
                         states->size / sizeof(std::uint32_t));
  const auto has = [&](std::uint32_t state) { return std::ranges::find(values, state) != values.end(); };
  Description& told = self(data).next;
  told.isActive = has(ZCOSMIC_TOPLEVEL_HANDLE_V1_STATE_ACTIVATED);
  told.isFullScreen = has(ZCOSMIC_TOPLEVEL_HANDLE_V1_STATE_FULLSCREEN);
  told.isMinimized = has(ZCOSMIC_TOPLEVEL_HANDLE_V1_STATE_MINIMIZED);
}

constexpr zcosmic_toplevel_handle_v1_listener kDetailsListener{
    .closed = ignore,
    .done = ignore,
    .title = ignore,
    .app_id = ignore,
    .output_enter =
        [](void* data, auto*, wl_output* output) {
          // One that has just gone is null.
          if (output != nullptr) self(data).next.outputs.push_back(output);
        },
    .output_leave = [](void* data, auto*, wl_output* output) { std::erase(self(data).next.outputs, output); },
    .workspace_enter = ignore,
    .workspace_leave = ignore,
    .state = setState,
    .geometry = ignore,
};

void destroy(const Toplevel& toplevel) {
  zcosmic_toplevel_handle_v1_destroy(static_cast<zcosmic_toplevel_handle_v1*>(toplevel.details));
  ext_foreign_toplevel_handle_v1_destroy(static_cast<ext_foreign_toplevel_handle_v1*>(toplevel.handle));
}

constexpr ext_foreign_toplevel_handle_v1_listener kToplevelListener{
    .closed =
        [](void* data, auto*) {
          destroy(self(data));
          wayland::removeToplevel(self(data));
        },
    .done = [](void* data, auto*) { wayland::completeToplevel(self(data)); },
    .title = [](void* data, auto*, const char* title) { self(data).next.title = title; },
    .app_id = [](void* data, auto*, const char* id) { self(data).next.applicationID = id; },
    .identifier = ignore,
};

void add(void*, ext_foreign_toplevel_list_v1*, ext_foreign_toplevel_handle_v1* handle) {
  Toplevel& toplevel = wayland::addToplevel(handle);
  ext_foreign_toplevel_handle_v1_add_listener(handle, &kToplevelListener, &toplevel);
  auto* const details = zcosmic_toplevel_info_v1_get_cosmic_toplevel(sInfo, handle);
  zcosmic_toplevel_handle_v1_add_listener(details, &kDetailsListener, &toplevel);
  toplevel.details = details;
  wayland::flush();
}

constexpr ext_foreign_toplevel_list_v1_listener kListListener{
    .toplevel = add,
    .finished = ignore,
};

void completeAll(void*, zcosmic_toplevel_info_v1*) {
  for (Toplevel* const toplevel : wayland::toplevels()) wayland::completeToplevel(*toplevel);
  if (!sAllAreKnown) wayland::noteAllAreKnown();
  sAllAreKnown = true;
}

constexpr zcosmic_toplevel_info_v1_listener kInfoListener{
    .toplevel = ignore,
    .finished = ignore,
    .done = completeAll,
};

}  // namespace

void noteList(const wayland::Offer& offer) { sListOffer = offer; }

void noteInfo(const wayland::Offer& offer) { sInfoOffer = offer; }

void beginInfo() {
  if (sListOffer.version == 0 || sInfoOffer.version < kVersion) return;
  wayland::beginToplevels();
  sAllAreKnown = false;
  sInfo = static_cast<zcosmic_toplevel_info_v1*>(
      wayland::accept(sInfoOffer, zcosmic_toplevel_info_v1_interface, kVersion));
  zcosmic_toplevel_info_v1_add_listener(sInfo, &kInfoListener, nullptr);
  sList = static_cast<ext_foreign_toplevel_list_v1*>(
      wayland::accept(sListOffer, ext_foreign_toplevel_list_v1_interface, 1));
  ext_foreign_toplevel_list_v1_add_listener(sList, &kListListener, nullptr);
}

void endInfo() {
  sListOffer = sInfoOffer = {};
  if (sInfo == nullptr) return;
  wayland::forgetToplevels(destroy);
  ext_foreign_toplevel_list_v1_destroy(sList);
  zcosmic_toplevel_info_v1_destroy(sInfo);
  sList = nullptr;
  sInfo = nullptr;
}

bool hasInfo() { return sInfo != nullptr; }

}  // namespace linux::windows::cosmic
