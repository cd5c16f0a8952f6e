#include "platform/linux/windows/wlr/toplevels.h"

#include <wayland-client.h>

#include <algorithm>
#include <memory>
#include <span>

#include "foreign_toplevel.h"

namespace linux::windows::wlr {

namespace {

zwlr_foreign_toplevel_manager_v1* sManager = nullptr;
std::vector<std::unique_ptr<Toplevel>> sToplevels;
std::uint64_t sLastNumber = 0;
unsigned sChanges = 0;

/// Whether those are still told of that were open before, and the ages of the oldest and the youngest.
bool sIsBeginning = true;
std::int64_t sOldest = 0;
std::int64_t sYoungest = 0;

auto find(const Toplevel& toplevel) {
  return std::ranges::find(sToplevels, &toplevel, &std::unique_ptr<Toplevel>::get);
}

Toplevel& self(void* data) { return *static_cast<Toplevel*>(data); }

void setState(Description& told, const wl_array& states) {
  const std::span values(static_cast<const std::uint32_t*>(states.data), states.size / sizeof(std::uint32_t));
  const auto has = [&](std::uint32_t state) { return std::ranges::find(values, state) != values.end(); };
  told.isActive = has(ZWLR_FOREIGN_TOPLEVEL_HANDLE_V1_STATE_ACTIVATED);
  told.isFullScreen = has(ZWLR_FOREIGN_TOPLEVEL_HANDLE_V1_STATE_FULLSCREEN);
  told.isMinimized = has(ZWLR_FOREIGN_TOPLEVEL_HANDLE_V1_STATE_MINIMIZED);
}

void complete(Toplevel& toplevel) {
  const Description& before = toplevel.description;
  const Description& now = toplevel.next;
  if (!toplevel.isComplete || before.isActive != now.isActive || before.isDialog != now.isDialog ||
      before.applicationID != now.applicationID) {
    ++sChanges;
  }
  if (now.isActive && !before.isActive && !sIsBeginning) {
    const auto place = find(toplevel);
    std::rotate(sToplevels.begin(), place, place + 1);
  }
  toplevel.description = toplevel.next;
  toplevel.isComplete = true;
}

void destroy(const Toplevel& toplevel) {
  if (toplevel.isComplete) ++sChanges;
  zwlr_foreign_toplevel_handle_v1_destroy(toplevel.handle);
}

void leave(Description& description, const wl_output* output) { std::erase(description.outputs, output); }

constexpr zwlr_foreign_toplevel_handle_v1_listener kToplevelListener{
    .title = [](void* data, auto*, const char* title) { self(data).next.title = title; },
    .app_id = [](void* data, auto*, const char* id) { self(data).next.applicationID = id; },
    .output_enter =
        [](void* data, auto*, wl_output* output) {
          // One that has just gone is null.
          if (output != nullptr) self(data).next.outputs.push_back(output);
        },
    .output_leave = [](void* data, auto*, wl_output* output) { leave(self(data).next, output); },
    .state = [](void* data, auto*, wl_array* states) { setState(self(data).next, *states); },
    .done = [](void* data, auto*) { complete(self(data)); },
    .closed =
        [](void* data, auto*) {
          const auto place = find(self(data));
          destroy(**place);
          sToplevels.erase(place);
        },
    .parent = [](void* data, auto*, auto* parent) { self(data).next.isDialog = parent != nullptr; },
};

void add(void*, zwlr_foreign_toplevel_manager_v1*, zwlr_foreign_toplevel_handle_v1* handle) {
  auto toplevel = std::make_unique<Toplevel>();
  toplevel->number = ++sLastNumber;
  toplevel->handle = handle;
  toplevel->age = sIsBeginning ? --sOldest : ++sYoungest;
  zwlr_foreign_toplevel_handle_v1_add_listener(handle, &kToplevelListener, toplevel.get());
  sToplevels.insert(sIsBeginning ? sToplevels.end() : sToplevels.begin(), std::move(toplevel));
}

constexpr zwlr_foreign_toplevel_manager_v1_listener kManagerListener{
    .toplevel = add,
    .finished = [](void*, auto*) { forgetToplevels(); },
};

}  // namespace

void followToplevels(zwlr_foreign_toplevel_manager_v1* manager) {
  sManager = manager;
  sIsBeginning = true;
  zwlr_foreign_toplevel_manager_v1_add_listener(manager, &kManagerListener, nullptr);
}

void noteAllAreKnown() {
  sIsBeginning = false;
  std::ranges::stable_partition(sToplevels, [](const auto& each) { return each->description.isActive; });
}

void forgetToplevels() {
  for (const auto& toplevel : sToplevels) destroy(*toplevel);
  sToplevels.clear();
  if (sManager != nullptr) zwlr_foreign_toplevel_manager_v1_destroy(sManager);
  sManager = nullptr;
}

bool followsToplevels() { return sManager != nullptr; }

std::vector<Toplevel*> toplevels() {
  std::vector<Toplevel*> complete;
  for (const auto& toplevel : sToplevels) {
    if (toplevel->isComplete) complete.push_back(toplevel.get());
  }
  return complete;
}

Toplevel* findToplevel(std::uint64_t number) {
  const auto found = std::ranges::find(sToplevels, number, [](const auto& each) { return each->number; });
  return found != sToplevels.end() ? found->get() : nullptr;
}

unsigned toplevelChanges() { return sChanges; }

void leaveOutput(wl_output* output) {
  for (const auto& toplevel : sToplevels) {
    leave(toplevel->description, output);
    leave(toplevel->next, output);
  }
}

}  // namespace linux::windows::wlr
