#include "platform/linux/windows/windows.h"

#include <algorithm>
#include <cstddef>
#include <optional>
#include <string_view>
#include <utility>

#include "platform/text/case.h"

namespace linux::windows {

namespace {

/// Tells the outputs of different back ends apart, in their ids.
constexpr std::uint32_t kMostBackends = 8;

std::vector<const Backend*> sBackends;
Use sUse = Use::Typing;

/// The merged windows, and by what ids their back ends know each, in the order of the back ends.
std::vector<Window> sWindows;
std::vector<std::vector<ID>> sIDs;

bool isOneOf(std::string_view name, const Window& window) {
  return !name.empty() && (text::equalIgnoringCase(name, window.applicationID) ||
                           text::equalIgnoringCase(name, window.className) ||
                           text::equalIgnoringCase(name, window.instanceName));
}

/// Whether two back ends may speak of the same window. Where a process is known, the compositor's and the X
/// server's are the same.
bool mayBeSame(const Window& a, const Window& b) {
  if (a.process != 0 && b.process != 0 && a.process != b.process) return false;
  return isOneOf(a.applicationID, b) || isOneOf(a.className, b) || isOneOf(a.instanceName, b);
}

/// Of the windows that this back end has not yet told of, the one that is the same; nothing when it is new.
std::optional<std::size_t> findSame(const Window& told, std::size_t known) {
  std::optional<std::size_t> same;
  for (std::size_t i = 0; i < known; ++i) {
    if (sIDs[i].back().backend == told.id.backend || !mayBeSame(sWindows[i], told)) continue;
    if (sWindows[i].title == told.title) return i;
    if (!same) same = i;
  }
  return same;
}

template <typename T>
void fillIn(T& value, const T& told) {
  if (value == T()) value = told;
}

/// Adds what the window lacks from what a later back end has told of it.
void fillIn(Window& window, const Window& told) {
  fillIn(window.process, told.process);
  fillIn(window.applicationID, told.applicationID);
  fillIn(window.instanceName, told.instanceName);
  fillIn(window.className, told.className);
  fillIn(window.isDialog, told.isDialog);
  fillIn(window.title, told.title);
  fillIn(window.isFullScreen, told.isFullScreen);
  fillIn(window.isShown, told.isShown);
  fillIn(window.area, told.area);
  fillIn(window.gtk, told.gtk);
}

/// Who is believed about the active window; null when nobody can tell.
const Backend* frontAuthority() {
  const auto found = std::find_if(sBackends.begin(), sBackends.end(),
                                  [](const Backend* backend) { return backend->knowsFront(); });
  return found != sBackends.end() ? *found : nullptr;
}

/// The windows of a back end with the titles that they have now, where others may know them too.
std::vector<Window> titled(const Backend& backend) {
  std::vector<Window> windows = backend.list();
  const auto knows = [](const Backend* each) { return !each->list().empty(); };
  if (std::ranges::count_if(sBackends, knows) < 2) return windows;
  std::vector<Window> looked = windows;
  backend.look(looked);
  for (std::size_t i = 0; i < windows.size(); ++i) windows[i].title = std::move(looked[i].title);
  return windows;
}

void merge() {
  sWindows.clear();
  sIDs.clear();
  const Backend* const authority = frontAuthority();
  for (const Backend* backend : sBackends) {
    const std::size_t known = sWindows.size();
    for (Window window : titled(*backend)) {
      window.isActive = window.isActive && backend == authority;
      const auto same = findSame(window, known);
      if (!same) {
        sIDs.push_back({window.id});
        sWindows.push_back(std::move(window));
        continue;
      }
      sIDs[*same].push_back(window.id);
      fillIn(sWindows[*same], window);
      fillIn(sWindows[*same].isActive, window.isActive);
    }
  }
}

/// Where the window stands in the list; nothing when it has gone.
std::optional<std::size_t> indexOf(ID window) {
  for (std::size_t i = 0; i < sIDs.size(); ++i) {
    if (std::find(sIDs[i].begin(), sIDs[i].end(), window) != sIDs[i].end()) return i;
  }
  return std::nullopt;
}

/// The window as one of its back ends tells of it now.
Window lookBy(ID id, const Window& window) {
  Window looked = window;
  looked.id = id;
  id.backend->look({&looked, 1});
  return looked;
}

/// The id by which a key reaches the window; none when no back end reaches it. The release goes where the
/// press went, wherever the focus is by then.
ID reachable(const Window& window, const std::vector<ID>& ids, bool down) {
  for (const ID& id : ids) {
    if (id.backend->reach() == Reach::AnyWindow) return id;
  }
  for (const ID& id : ids) {
    if (id.backend->reach() == Reach::FocusedWindow && (window.isActive || !down)) return id;
  }
  return {};
}

bool coversMost(const Area& area, const Area& output) {
  const std::int64_t width =
      std::min(area.x + area.width, output.x + output.width) - std::max(area.x, output.x);
  const std::int64_t height =
      std::min(area.y + area.height, output.y + output.height) - std::max(area.y, output.y);
  const std::int64_t whole = std::int64_t{output.width} * output.height;
  return width > 0 && height > 0 && 2 * width * height > whole;
}

}  // namespace

void init(std::vector<const Backend*> backends, Use use) {
  sBackends = std::move(backends);
  sUse = use;
  for (const Backend* backend : sBackends) {
    if (backend->init != nullptr) backend->init();
  }
}

void finish() {
  for (const Backend* backend : sBackends) backend->close();
  init({});
  merge();
}

std::span<const Backend* const> backends() { return sBackends; }

bool keysAreWanted() { return sUse == Use::Typing; }

bool isOpen() {
  return std::any_of(sBackends.begin(), sBackends.end(),
                     [](const Backend* backend) { return backend->open(); });
}

bool takeIn() {
  bool changed = false;
  for (const Backend* backend : sBackends) {
    changed |= backend->takeIn();
  }
  if (changed) merge();
  return changed;
}

const std::vector<Window>& list() { return sWindows; }

const Window* front() {
  const auto found =
      std::find_if(sWindows.begin(), sWindows.end(), [](const Window& window) { return window.isActive; });
  return found != sWindows.end() ? &*found : nullptr;
}

bool knowsFront() { return frontAuthority() != nullptr; }

std::vector<Window> look(std::span<const ID> windows) {
  std::vector<Window> looked;
  for (const ID& window : windows) {
    const auto index = indexOf(window);
    if (!index) continue;
    Window& now = looked.emplace_back(lookBy(sIDs[*index].front(), sWindows[*index]));
    for (std::size_t i = 1; i < sIDs[*index].size(); ++i) {
      const Window told = lookBy(sIDs[*index][i], sWindows[*index]);
      // An X server takes what is on a workspace of the compositor's that nobody sees for shown.
      const bool isShown = now.isShown && told.isShown;
      fillIn(now, told);
      now.isShown = isShown;
    }
  }
  return looked;
}

void activate(ID window) {
  if (window) window.backend->activate(window.number);
}

bool sendKey(ID window, std::uint32_t keysym, bool down, Modifiers modifiers) {
  if (!window) return false;
  // A window that has gone is still owed the release of its key.
  const auto index = indexOf(window);
  const ID reached = index ? reachable(sWindows[*index], sIDs[*index], down) : window;
  return reached && reached.backend->sendKey(reached.number, keysym, down, modifiers);
}

bool takesKeys(ID window) {
  const auto index = indexOf(window);
  return index && reachable(sWindows[*index], sIDs[*index], true);
}

std::vector<Output> outputs() {
  for (std::uint32_t i = 0; i < sBackends.size(); ++i) {
    std::vector<Output> told = sBackends[i]->outputs();
    if (told.empty()) continue;
    for (Output& output : told) output.id = output.id * kMostBackends + i;
    return told;
  }
  return {};
}

bool isCaptured(std::uint32_t id) {
  const std::size_t which = id % kMostBackends;
  if (which >= sBackends.size()) return false;
  const std::vector<Output> all = sBackends[which]->outputs();
  const auto output =
      std::find_if(all.begin(), all.end(), [&](const Output& each) { return each.id == id / kMostBackends; });
  if (output == all.end()) return false;
  std::vector<Window> windows = sBackends[which]->list();
  sBackends[which]->look(windows);
  return std::any_of(windows.begin(), windows.end(), [&](const Window& window) {
    return window.isFullScreen && window.isShown && coversMost(window.area, output->area);
  });
}

}  // namespace linux::windows
