#include "platform/linux/windows/kwin/plasma_windows.h"

#include <wayland-client.h>

#include <algorithm>
#include <functional>
#include <memory>
#include <string>
#include <string_view>

#include "plasma_window_management.h"
#include "platform/linux/windows/kwin/desktops.h"
#include "platform/linux/windows/wayland/outputs.h"

namespace linux::windows::kwin {

namespace {

/// The first version that tells windows by uuid, and the last that tells their order without being asked.
constexpr std::uint32_t kOldest = 13;
constexpr std::uint32_t kNewest = 16;

struct PlasmaWindow {
  /// Never used again, and never 0.
  std::uint64_t number = 0;
  /// What KWin calls it.
  std::string uuid;
  org_kde_plasma_window* proxy = nullptr;
  /// All of its initial state has been told.
  bool isComplete = false;
  /// It has a place. KWin goes on to tell newcomers of some that have gone, without one.
  bool isPlaced = false;

  std::string title;
  std::string applicationID;
  /// Of an X11 program.
  std::string resourceName;
  pid_t process = 0;
  /// org_kde_plasma_window_management.state.
  std::uint32_t state = 0;
  bool isDialog = false;
  /// Of its frame, in the compositor's own space.
  int x = 0;
  int y = 0;
  /// The virtual desktops that it is on; on all of them when there are none.
  std::vector<std::string> desktops;
};

org_kde_plasma_window_management* sManager = nullptr;
/// Topmost first.
std::vector<std::unique_ptr<PlasmaWindow>> sWindows;
std::uint64_t sLastNumber = 0;
unsigned sChanges = 0;

PlasmaWindow& self(void* data) { return *static_cast<PlasmaWindow*>(data); }

/// Takes in what tells whose window it is.
template <typename T, typename Told>
void change(T& value, const Told& told) {
  if (value == told) return;
  value = told;
  ++sChanges;
}

void setState(void* data, org_kde_plasma_window*, std::uint32_t state) {
  constexpr std::uint32_t kOfInterest =
      ORG_KDE_PLASMA_WINDOW_MANAGEMENT_STATE_ACTIVE | ORG_KDE_PLASMA_WINDOW_MANAGEMENT_STATE_SKIPTASKBAR;
  if (((state ^ self(data).state) & kOfInterest) != 0) ++sChanges;
  self(data).state = state;
}

void destroy(const PlasmaWindow& window) { org_kde_plasma_window_destroy(window.proxy); }

void remove(void* data, org_kde_plasma_window*) {
  destroy(self(data));
  std::erase_if(sWindows, [&](const auto& each) { return each.get() == data; });
  ++sChanges;
}

template <typename... Arguments>
void ignore(void*, Arguments...) {}

/// What comes with a later version is never told, as it is not asked for.
org_kde_plasma_window_listener makeWindowListener() {
  org_kde_plasma_window_listener made{};
  made.title_changed = [](void* data, auto*, const char* title) { self(data).title = title; };
  made.app_id_changed = [](void* data, auto*, const char* id) { change(self(data).applicationID, id); };
  made.state_changed = setState;
  made.virtual_desktop_changed = ignore;
  made.themed_icon_name_changed = ignore;
  made.unmapped = remove;
  made.initial_state = [](void* data, auto*) { change(self(data).isComplete, true); };
  made.parent_window = [](void* data, auto*, auto* parent) {
    change(self(data).isDialog, parent != nullptr);
  };
  made.geometry = [](void* data, auto*, std::int32_t x, std::int32_t y, std::uint32_t, std::uint32_t) {
    self(data).x = x;
    self(data).y = y;
    change(self(data).isPlaced, true);
  };
  made.icon_changed = ignore;
  made.pid_changed = [](void* data, auto*, std::uint32_t process) {
    change(self(data).process, static_cast<pid_t>(process));
  };
  made.virtual_desktop_entered = [](void* data, auto*, const char* id) {
    self(data).desktops.emplace_back(id);
  };
  made.virtual_desktop_left = [](void* data, auto*, const char* id) { std::erase(self(data).desktops, id); };
  made.application_menu = ignore;
  made.activity_entered = ignore;
  made.activity_left = ignore;
  made.resource_name_changed = [](void* data, auto*, const char* name) {
    change(self(data).resourceName, name);
  };
  return made;
}

void add(void*, org_kde_plasma_window_management*, std::uint32_t, const char* uuid) {
  static const org_kde_plasma_window_listener listener = makeWindowListener();
  auto window = std::make_unique<PlasmaWindow>();
  window->number = ++sLastNumber;
  window->uuid = uuid;
  window->proxy = org_kde_plasma_window_management_get_window_by_uuid(sManager, uuid);
  org_kde_plasma_window_add_listener(window->proxy, &listener, window.get());
  sWindows.insert(sWindows.begin(), std::move(window));
}

/// The order is told from below, with semicolons between.
void sort(void*, org_kde_plasma_window_management*, const char* uuids) {
  const std::string_view order(uuids);
  // One that is not told of is new.
  std::ranges::stable_sort(sWindows, std::greater(),
                           [&](const auto& each) { return order.rfind(each->uuid); });
  ++sChanges;
}

org_kde_plasma_window_management_listener makeListener() {
  org_kde_plasma_window_management_listener made{};
  made.show_desktop_changed = ignore;
  made.window = ignore;
  made.stacking_order_changed = ignore;
  made.stacking_order_uuid_changed = sort;
  made.window_with_uuid = add;
  return made;
}

Window windowOf(const PlasmaWindow& told) {
  const auto is = [&](std::uint32_t state) { return (told.state & state) != 0; };
  Window window;
  window.id.number = told.number;
  window.process = told.process;
  window.applicationID = window.className = told.applicationID;
  window.instanceName = told.resourceName;
  window.isDialog = told.isDialog;
  window.isActive = is(ORG_KDE_PLASMA_WINDOW_MANAGEMENT_STATE_ACTIVE);
  window.title = told.title;
  window.isShown = !is(ORG_KDE_PLASMA_WINDOW_MANAGEMENT_STATE_MINIMIZED) && isAnyShown(told.desktops);
  window.isFullScreen = is(ORG_KDE_PLASMA_WINDOW_MANAGEMENT_STATE_FULLSCREEN) && window.isShown;
  // What is full screen begins where its output does.
  if (window.isFullScreen) window.area = wayland::areaAt(told.x, told.y);
  return window;
}

std::vector<Window> openedWindows() {
  std::vector<Window> opened;
  for (const auto& window : sWindows) {
    const bool isListed = (window->state & ORG_KDE_PLASMA_WINDOW_MANAGEMENT_STATE_SKIPTASKBAR) == 0;
    if (window->isComplete && window->isPlaced && isListed) opened.push_back(windowOf(*window));
  }
  return opened;
}

void activate(std::uint64_t number) {
  constexpr std::uint32_t kActive = ORG_KDE_PLASMA_WINDOW_MANAGEMENT_STATE_ACTIVE;
  const auto window = std::ranges::find(sWindows, number, [](const auto& each) { return each->number; });
  if (window == sWindows.end()) return;
  org_kde_plasma_window_set_state((*window)->proxy, kActive, kActive);
  wayland::flush();
}

}  // namespace

void takeManager(const wayland::Offer& offer) {
  static const org_kde_plasma_window_management_listener listener = makeListener();
  if (sManager != nullptr || offer.version < kOldest) return;
  sManager = static_cast<org_kde_plasma_window_management*>(
      wayland::accept(offer, org_kde_plasma_window_management_interface, kNewest));
  org_kde_plasma_window_management_add_listener(sManager, &listener, nullptr);
}

void dropManager() {
  for (const auto& window : sWindows) destroy(*window);
  sWindows.clear();
  if (sManager != nullptr) org_kde_plasma_window_management_destroy(sManager);
  sManager = nullptr;
  ++sChanges;
}

bool hasManager() { return sManager != nullptr; }

const Source kPlasma{
    .changes = [] { return sChanges; },
    .windows = openedWindows,
    .activate = activate,
};

}  // namespace linux::windows::kwin
