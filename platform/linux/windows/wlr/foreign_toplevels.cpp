#include "platform/linux/windows/wlr/foreign_toplevels.h"

#include <wayland-client.h>

#include <algorithm>
#include <cstdint>
#include <span>
#include <vector>

#include "foreign_toplevel.h"

namespace linux::windows::wlr {

namespace {

using wayland::Description;
using wayland::Toplevel;

zwlr_foreign_toplevel_manager_v1* sManager = nullptr;

Toplevel& self(void* data) { return *static_cast<Toplevel*>(data); }

void setState(Description& told, const wl_array& states) {
  const std::span values(static_cast<const std::uint32_t*>(states.data), states.size / sizeof(std::uint32_t));
  const auto has = [&](std::uint32_t state) { return std::ranges::find(values, state) != values.end(); };
  told.isActive = has(ZWLR_FOREIGN_TOPLEVEL_HANDLE_V1_STATE_ACTIVATED);
  told.isFullScreen = has(ZWLR_FOREIGN_TOPLEVEL_HANDLE_V1_STATE_FULLSCREEN);
  told.isMinimized = has(ZWLR_FOREIGN_TOPLEVEL_HANDLE_V1_STATE_MINIMIZED);
}

void destroy(const Toplevel& toplevel) {
  zwlr_foreign_toplevel_handle_v1_destroy(static_cast<zwlr_foreign_toplevel_handle_v1*>(toplevel.handle));
}

constexpr zwlr_foreign_toplevel_handle_v1_listener kToplevelListener{
    .title = [](void* data, auto*, const char* title) { self(data).next.title = title; },
    .app_id = [](void* data, auto*, const char* id) { self(data).next.applicationID = id; },
    .output_enter =
        [](void* data, auto*, wl_output* output) {
          // One that has just gone is null.
          if (output != nullptr) self(data).next.outputs.push_back(output);
        },
    .output_leave = [](void* data, auto*, wl_output* output) { std::erase(self(data).next.outputs, output); },
    .state = [](void* data, auto*, wl_array* states) { setState(self(data).next, *states); },
    .done = [](void* data, auto*) { wayland::completeToplevel(self(data)); },
    .closed =
        [](void* data, auto*) {
          destroy(self(data));
          wayland::removeToplevel(self(data));
        },
    .parent = [](void* data, auto*, auto* parent) { self(data).next.isDialog = parent != nullptr; },
};

void add(void*, zwlr_foreign_toplevel_manager_v1*, zwlr_foreign_toplevel_handle_v1* handle) {
  zwlr_foreign_toplevel_handle_v1_add_listener(handle, &kToplevelListener, &wayland::addToplevel(handle));
}

constexpr zwlr_foreign_toplevel_manager_v1_listener kManagerListener{
    .toplevel = add,
    .finished = [](void*, auto*) { dropManager(); },
};

}  // namespace

void takeManager(const wayland::Offer& offer) {
  if (sManager != nullptr) return;
  sManager = static_cast<zwlr_foreign_toplevel_manager_v1*>(
      wayland::accept(offer, zwlr_foreign_toplevel_manager_v1_interface, 3));
  wayland::beginToplevels();
  zwlr_foreign_toplevel_manager_v1_add_listener(sManager, &kManagerListener, nullptr);
}

void dropManager() {
  if (sManager == nullptr) return;
  wayland::forgetToplevels(destroy);
  zwlr_foreign_toplevel_manager_v1_destroy(sManager);
  sManager = nullptr;
}

bool hasManager() { return sManager != nullptr; }

void activate(const Toplevel& toplevel, wl_seat* seat) {
  zwlr_foreign_toplevel_handle_v1_activate(static_cast<zwlr_foreign_toplevel_handle_v1*>(toplevel.handle),
                                           seat);
}

}  // namespace linux::windows::wlr
