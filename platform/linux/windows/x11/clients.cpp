#include "platform/linux/windows/x11/clients.h"

#include <xcb/res.h>

#include <algorithm>
#include <optional>

#include "platform/linux/windows/x11/connection.h"
#include "platform/linux/windows/x11/x11.h"

namespace linux::windows::x11 {

namespace {

/// On every desktop of the window manager.
constexpr std::uint32_t kEveryDesktop = 0xFFFFFFFF;

/// What is known of the windows, as far as the events told.
std::vector<Window> sClients;
/// changes().windows when it was read.
unsigned sChanges = 0;

xcb_window_t numberOf(const Window& window) { return static_cast<xcb_window_t>(window.id.number); }

/// The process that connected, from the answer to the one question asked about it; 0 where the server does
/// not tell.
pid_t connectedProcess(const xcb_res_query_client_ids_reply_t& reply) {
  for (auto ids = xcb_res_query_client_ids_ids_iterator(&reply); ids.rem > 0;
       xcb_res_client_id_value_next(&ids)) {
    const bool isProcess = (ids.data->spec.mask & XCB_RES_CLIENT_ID_MASK_LOCAL_CLIENT_PID) != 0;
    if (isProcess && xcb_res_client_id_value_value_length(ids.data) == 1) {
      return static_cast<pid_t>(*xcb_res_client_id_value_value(ids.data));
    }
  }
  return 0;
}

void setClass(Window& window, const std::string& both) {
  const std::size_t end = both.find('\0');
  window.instanceName = both.substr(0, end);
  window.className = end != std::string::npos ? firstText(both.substr(end + 1)) : std::string();
}

// ---- Who a window is

struct IdentityCookies {
  xcb_get_property_cookie_t windowClass;
  xcb_get_property_cookie_t application;
  xcb_get_property_cookie_t owner;
  xcb_get_property_cookie_t process;
  std::optional<xcb_res_query_client_ids_cookie_t> connected;
};

IdentityCookies askIdentity(xcb_connection_t* server, xcb_window_t window) {
  IdentityCookies cookies{askProperty(window, XCB_ATOM_WM_CLASS), askProperty(window, atom(GtkApplicationId)),
                          askProperty(window, XCB_ATOM_WM_TRANSIENT_FOR), askProperty(window, atom(NetWmPid)),
                          std::nullopt};
  if (hasResource()) {
    const xcb_res_client_id_spec_t spec{window, XCB_RES_CLIENT_ID_MASK_LOCAL_CLIENT_PID};
    cookies.connected = xcb_res_query_client_ids(server, 1, &spec);
  }
  return cookies;
}

Window awaitIdentity(xcb_window_t number, const IdentityCookies& cookies) {
  Window window;
  window.id = {&kBackend, number};
  setClass(window, awaitText(cookies.windowClass));
  window.applicationID = awaitText(cookies.application);
  window.isDialog = Numbers(cookies.owner).first(XCB_NONE) != XCB_NONE;
  window.process = static_cast<pid_t>(Numbers(cookies.process).first(0));
  if (!cookies.connected) return window;
  // A window may say any process; the server knows who connected.
  const auto connected = await<xcb_res_query_client_ids_reply_t>(*cookies.connected);
  const pid_t process = connected != nullptr ? connectedProcess(*connected) : 0;
  if (process != 0) window.process = process;
  return window;
}

std::vector<Window> identify(xcb_connection_t* server, const std::vector<xcb_window_t>& numbers) {
  std::vector<IdentityCookies> cookies;
  cookies.reserve(numbers.size());
  for (const xcb_window_t number : numbers) cookies.push_back(askIdentity(server, number));
  std::vector<Window> windows;
  for (std::size_t i = 0; i < numbers.size(); ++i) windows.push_back(awaitIdentity(numbers[i], cookies[i]));
  return windows;
}

/// The managed windows, topmost first, or the newest first where the window manager does not tell the order.
std::vector<xcb_window_t> topmostFirst(const Numbers& stacking, const Numbers& byAge) {
  const auto listed = stacking.values().empty() ? byAge.values() : stacking.values();
  return {listed.rbegin(), listed.rend()};
}

std::vector<Window> readClients(xcb_connection_t* server) {
  const auto stackingCookie = askProperty(root(), atom(NetClientListStacking));
  const auto byAgeCookie = askProperty(root(), atom(NetClientList));
  const auto activeCookie = askProperty(root(), atom(NetActiveWindow));
  const Numbers stacking(stackingCookie);
  const Numbers byAge(byAgeCookie);
  const xcb_window_t active = Numbers(activeCookie).first(XCB_NONE);
  std::vector<Window> windows = identify(server, topmostFirst(stacking, byAge));
  for (Window& window : windows) window.isActive = numberOf(window) == active;
  return windows;
}

// ---- How a window looks

struct LookCookies {
  xcb_get_property_cookie_t windowClass;
  xcb_get_property_cookie_t title;
  xcb_get_property_cookie_t busName;
  xcb_get_property_cookie_t applicationPath;
  xcb_get_property_cookie_t windowPath;
  xcb_get_property_cookie_t state;
  xcb_get_property_cookie_t desktop;
  xcb_get_window_attributes_cookie_t attributes;
  xcb_get_geometry_cookie_t size;
  xcb_translate_coordinates_cookie_t place;
};

LookCookies askLook(xcb_connection_t* server, xcb_window_t window) {
  return {
      askProperty(window, XCB_ATOM_WM_CLASS),
      askProperty(window, atom(NetWmName)),
      askProperty(window, atom(GtkUniqueBusName)),
      askProperty(window, atom(GtkApplicationObjectPath)),
      askProperty(window, atom(GtkWindowObjectPath)),
      askProperty(window, atom(NetWmState)),
      askProperty(window, atom(NetWmDesktop)),
      xcb_get_window_attributes(server, window),
      xcb_get_geometry(server, window),
      xcb_translate_coordinates(server, window, root(), 0, 0),
  };
}

void awaitLook(Window& window, const LookCookies& cookies, std::uint32_t currentDesktop) {
  setClass(window, awaitText(cookies.windowClass));
  window.title = firstText(awaitText(cookies.title));
  window.gtk = {firstText(awaitText(cookies.busName)), firstText(awaitText(cookies.applicationPath)),
                firstText(awaitText(cookies.windowPath))};
  const Numbers state(cookies.state);
  window.isFullScreen = state.contains(atom(NetWmStateFullscreen)) && !state.contains(atom(NetWmStateHidden));
  const std::uint32_t desktop = Numbers(cookies.desktop).first(kEveryDesktop);
  const auto attributes = await<xcb_get_window_attributes_reply_t>(cookies.attributes);
  // Viewable is mapped with all that it is in.
  window.isShown = attributes != nullptr && attributes->map_state == XCB_MAP_STATE_VIEWABLE &&
                   (desktop == currentDesktop || desktop == kEveryDesktop || currentDesktop == kEveryDesktop);
  const auto size = await<xcb_get_geometry_reply_t>(cookies.size);
  const auto place = await<xcb_translate_coordinates_reply_t>(cookies.place);
  const bool placed = size != nullptr && place != nullptr;
  window.area = placed ? Area{place->dst_x, place->dst_y, size->width, size->height} : Area{};
}

}  // namespace

bool takeInClients() {
  xcb_connection_t* const server = connection();
  std::vector<Window> windows;
  if (server != nullptr) {
    if (sChanges == changes().windows) return false;
    sChanges = changes().windows;
    windows = readClients(server);
  }
  if (windows == sClients) return false;
  sClients = std::move(windows);
  return true;
}

const std::vector<Window>& clients() { return sClients; }

void look(std::span<Window> windows) {
  xcb_connection_t* const server = connection();
  if (server == nullptr) return;
  const auto currentCookie = askProperty(root(), atom(NetCurrentDesktop));
  std::vector<LookCookies> cookies;
  cookies.reserve(windows.size());
  for (const Window& window : windows) cookies.push_back(askLook(server, numberOf(window)));
  const std::uint32_t current = Numbers(currentCookie).first(kEveryDesktop);
  for (std::size_t i = 0; i < windows.size(); ++i) awaitLook(windows[i], cookies[i], current);
}

}  // namespace linux::windows::x11
