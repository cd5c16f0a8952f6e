#include "platform/linux/windows/x11/outputs.h"

#include <xcb/randr.h>

#include "platform/linux/windows/x11/connection.h"

namespace linux::windows::x11 {

namespace {

std::vector<Output> monitors(xcb_connection_t* server) {
  std::vector<Output> found;
  const auto reply =
      await<xcb_randr_get_monitors_reply_t>(xcb_randr_get_monitors(server, root(), /*get_active=*/1));
  if (reply == nullptr) return found;
  for (auto each = xcb_randr_get_monitors_monitors_iterator(reply.get()); each.rem > 0;
       xcb_randr_monitor_info_next(&each)) {
    const xcb_randr_monitor_info_t& monitor = *each.data;
    found.push_back({monitor.name, {monitor.x, monitor.y, monitor.width, monitor.height}});
  }
  return found;
}

/// All that there is to see, as one output.
Output wholeScreen(xcb_connection_t* server) {
  const auto size = await<xcb_get_geometry_reply_t>(xcb_get_geometry(server, root()));
  if (size == nullptr) return {root(), {}};
  return {root(), {0, 0, size->width, size->height}};
}

}  // namespace

std::vector<Output> outputs() {
  xcb_connection_t* const server = connection();
  if (server == nullptr) return {};
  std::vector<Output> found;
  if (hasRandr()) found = monitors(server);
  if (found.empty()) found.push_back(wholeScreen(server));
  return found;
}

}  // namespace linux::windows::x11
