#include "platform/linux/windows/x11/x11.h"

#include <xcb/res.h>

#include <algorithm>
#include <array>
#include <optional>
#include <string_view>

#include "platform/base/run_loop.h"
#include "platform/linux/windows/x11/connection.h"

namespace desktop {

namespace {

using x::askProperty;
using x::atom;
using x::await;
using x::awaitText;
using x::Numbers;

/// The office's windows change their class with the document in them.
constexpr std::string_view kChangingClass = "libreoffice";

/// What is known of the windows, as far as the events told.
struct Knowledge {
  std::vector<Client> clients;
  Window active = XCB_NONE;
  /// x::changes().windows when it was read.
  unsigned changes = 0;
  /// The turn in which classes that change were last looked at.
  std::optional<std::uint64_t> classesRead;
};

Knowledge sKnown;

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

struct IdentityCookies {
  xcb_get_property_cookie_t windowClass;
  xcb_get_property_cookie_t application;
  xcb_get_property_cookie_t owner;
  xcb_get_property_cookie_t process;
  std::optional<xcb_res_query_client_ids_cookie_t> connected;
};

IdentityCookies askIdentity(xcb_connection_t* server, Window window) {
  IdentityCookies cookies{
      askProperty(window, XCB_ATOM_WM_CLASS), askProperty(window, atom(x::GtkApplicationId)),
      askProperty(window, XCB_ATOM_WM_TRANSIENT_FOR), askProperty(window, atom(x::NetWmPid)), std::nullopt};
  if (x::hasResource()) {
    const xcb_res_client_id_spec_t spec{window, XCB_RES_CLIENT_ID_MASK_LOCAL_CLIENT_PID};
    cookies.connected = xcb_res_query_client_ids(server, 1, &spec);
  }
  return cookies;
}

Client awaitIdentity(Window window, const IdentityCookies& cookies) {
  Client client;
  client.window = window;
  const std::string both = awaitText(cookies.windowClass);
  const std::size_t end = both.find('\0');
  client.instanceName = both.substr(0, end);
  if (end != std::string::npos) client.className = both.substr(end + 1, both.find('\0', end + 1) - end - 1);
  client.applicationID = awaitText(cookies.application);
  client.isDialog = Numbers(cookies.owner).first(XCB_NONE) != XCB_NONE;
  client.process = static_cast<pid_t>(Numbers(cookies.process).first(0));
  if (!cookies.connected) return client;
  const auto connected = await<xcb_res_query_client_ids_reply_t>(*cookies.connected);
  const pid_t process = connected != nullptr ? connectedProcess(*connected) : 0;
  if (process != 0) client.process = process;
  return client;
}

std::vector<Client> identify(xcb_connection_t* server, const std::vector<Window>& windows) {
  std::vector<IdentityCookies> cookies;
  cookies.reserve(windows.size());
  for (const Window window : windows) cookies.push_back(askIdentity(server, window));
  std::vector<Client> clients;
  for (std::size_t i = 0; i < windows.size(); ++i) clients.push_back(awaitIdentity(windows[i], cookies[i]));
  return clients;
}

bool sameClient(const Client& a, const Client& b) {
  return a.window == b.window && a.process == b.process && a.instanceName == b.instanceName &&
         a.className == b.className && a.applicationID == b.applicationID && a.isDialog == b.isDialog;
}

/// The managed windows, topmost first, or the newest first where the window manager does not tell the order.
std::vector<Window> topmostFirst(const Numbers& stacking, const Numbers& byAge) {
  const auto listed = stacking.values().empty() ? byAge.values() : stacking.values();
  return {listed.rbegin(), listed.rend()};
}

/// Replaces the clients; true when that changed something.
bool know(std::vector<Client> clients) {
  const bool changed =
      !std::equal(clients.begin(), clients.end(), sKnown.clients.begin(), sKnown.clients.end(), sameClient);
  sKnown.clients = std::move(clients);
  return changed;
}

bool readEverything(xcb_connection_t* server) {
  sKnown.changes = x::changes().windows;
  const auto stackingCookie = askProperty(x::root(), atom(x::NetClientListStacking));
  const auto byAgeCookie = askProperty(x::root(), atom(x::NetClientList));
  const auto activeCookie = askProperty(x::root(), atom(x::NetActiveWindow));
  const Numbers stacking(stackingCookie);
  const Numbers byAge(byAgeCookie);
  sKnown.active = Numbers(activeCookie).first(XCB_NONE);
  sKnown.classesRead = base::turn();
  return know(identify(server, topmostFirst(stacking, byAge)));
}

bool hasChangingClass(const Client& client) { return client.className.starts_with(kChangingClass); }

bool readChangingClasses(xcb_connection_t* server) {
  if (sKnown.classesRead == base::turn()) return false;
  sKnown.classesRead = base::turn();
  std::vector<Window> windows;
  for (const Client& client : sKnown.clients) {
    if (hasChangingClass(client)) windows.push_back(client.window);
  }
  if (windows.empty()) return false;
  std::vector<Client> clients = sKnown.clients;
  for (Client& fresh : identify(server, windows)) {
    const auto known = std::find_if(clients.begin(), clients.end(),
                                    [&](const Client& client) { return client.window == fresh.window; });
    *known = std::move(fresh);
  }
  return know(std::move(clients));
}

}  // namespace

bool hasXServer() { return x::connection() != nullptr; }

bool takeInX() {
  xcb_connection_t* const server = x::connection();
  if (server == nullptr) {
    sKnown.active = XCB_NONE;
    return know({});
  }
  return sKnown.changes != x::changes().windows ? readEverything(server) : readChangingClasses(server);
}

const std::vector<Client>& clients() { return sKnown.clients; }

Window activeWindow() { return sKnown.active; }

}  // namespace desktop
