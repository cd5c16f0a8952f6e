// What the person sees: outputs, and the windows that fill them.

#include <xcb/randr.h>

#include <algorithm>
#include <cstdint>

#include "platform/linux/windows/x11/connection.h"
#include "platform/linux/windows/x11/x11.h"

namespace desktop {

namespace {

using x::askProperty;
using x::atom;
using x::await;
using x::Numbers;

/// On every desktop of the window manager.
constexpr std::uint32_t kEveryDesktop = 0xFFFFFFFF;

struct Area {
  int x = 0;
  int y = 0;
  int width = 0;
  int height = 0;
};

/// The windows that say to be full screen and are not hidden.
std::vector<Window> fullScreenOf(const std::vector<Window>& windows) {
  std::vector<xcb_get_property_cookie_t> cookies;
  cookies.reserve(windows.size());
  for (const Window window : windows) cookies.push_back(askProperty(window, atom(x::NetWmState)));
  std::vector<Window> found;
  for (std::size_t i = 0; i < windows.size(); ++i) {
    const Numbers state(cookies[i]);
    if (state.contains(atom(x::NetWmStateFullscreen)) && !state.contains(atom(x::NetWmStateHidden))) {
      found.push_back(windows[i]);
    }
  }
  return found;
}

/// Mapped with all that it is in, and on the current desktop.
bool isShown(xcb_connection_t* server, Window window) {
  const auto attributesCookie = xcb_get_window_attributes(server, window);
  const auto desktopCookie = askProperty(window, atom(x::NetWmDesktop));
  const auto currentCookie = askProperty(x::root(), atom(x::NetCurrentDesktop));
  const auto attributes = await<xcb_get_window_attributes_reply_t>(attributesCookie);
  const std::uint32_t desktop = Numbers(desktopCookie).first(kEveryDesktop);
  const std::uint32_t current = Numbers(currentCookie).first(desktop);
  return attributes != nullptr && attributes->map_state == XCB_MAP_STATE_VIEWABLE &&
         (desktop == current || desktop == kEveryDesktop);
}

Area areaOf(xcb_connection_t* server, Window window) {
  const auto sizeCookie = xcb_get_geometry(server, window);
  const auto placeCookie = xcb_translate_coordinates(server, window, x::root(), 0, 0);
  const auto size = await<xcb_get_geometry_reply_t>(sizeCookie);
  const auto place = await<xcb_translate_coordinates_reply_t>(placeCookie);
  if (size == nullptr || place == nullptr) return {};
  return {place->dst_x, place->dst_y, size->width, size->height};
}

bool coversMost(const Area& area, const Output& output) {
  const std::int64_t width =
      std::min(area.x + area.width, output.x + output.width) - std::max(area.x, output.x);
  const std::int64_t height =
      std::min(area.y + area.height, output.y + output.height) - std::max(area.y, output.y);
  const std::int64_t whole = std::int64_t{output.width} * output.height;
  return width > 0 && height > 0 && 2 * width * height > whole;
}

std::vector<Output> monitors(xcb_connection_t* server) {
  std::vector<Output> found;
  const auto reply =
      await<xcb_randr_get_monitors_reply_t>(xcb_randr_get_monitors(server, x::root(), /*get_active=*/1));
  if (reply == nullptr) return found;
  for (auto each = xcb_randr_get_monitors_monitors_iterator(reply.get()); each.rem > 0;
       xcb_randr_monitor_info_next(&each)) {
    const xcb_randr_monitor_info_t& monitor = *each.data;
    found.push_back({monitor.name, monitor.x, monitor.y, monitor.width, monitor.height});
  }
  return found;
}

/// All that there is to see, as one output.
Output wholeScreen(xcb_connection_t* server) {
  const Area area = areaOf(server, x::root());
  return {x::root(), area.x, area.y, area.width, area.height};
}

}  // namespace

bool isFullScreen(Window window) {
  xcb_connection_t* const server = x::connection();
  return server != nullptr && !fullScreenOf({window}).empty() && isShown(server, window);
}

std::vector<Output> outputs() {
  xcb_connection_t* const server = x::connection();
  if (server == nullptr) return {};
  std::vector<Output> found;
  if (x::hasRandr()) found = monitors(server);
  if (found.empty()) found.push_back(wholeScreen(server));
  return found;
}

bool isCaptured(std::uint32_t id) {
  const std::vector<Output> all = outputs();
  const auto output = std::find_if(all.begin(), all.end(), [&](const Output& each) { return each.id == id; });
  xcb_connection_t* const server = x::connection();
  if (server == nullptr || output == all.end()) return false;
  std::vector<Window> windows;
  for (const Client& client : clients()) windows.push_back(client.window);
  const std::vector<Window> full = fullScreenOf(windows);
  return std::any_of(full.begin(), full.end(), [&](Window window) {
    return isShown(server, window) && coversMost(areaOf(server, window), *output);
  });
}

}  // namespace desktop
