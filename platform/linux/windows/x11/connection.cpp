#include "platform/linux/windows/x11/connection.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/wait.h>
#include <unistd.h>
#include <xcb/randr.h>
#include <xcb/res.h>
#include <xcb/xcbext.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>
#include <optional>
#include <string_view>

#include "platform/base/deadline.h"
#include "platform/base/file_descriptor.h"
#include "platform/base/run_loop.h"
#include "platform/host.h"
#include "platform/linux/system/turn.h"
#include "platform/linux/windows/session.h"

namespace linux::windows::x11 {
namespace {

// In the order of Atom, one a line.
// clang-format off
constexpr std::array<const char*, kAtomCount> kAtomNames = {
    "_NET_ACTIVE_WINDOW",
    "_NET_CLIENT_LIST",
    "_NET_CLIENT_LIST_STACKING",
    "_NET_CURRENT_DESKTOP",
    "_NET_WM_DESKTOP",
    "_NET_WM_NAME",
    "_NET_WM_PID",
    "_NET_WM_STATE",
    "_NET_WM_STATE_FULLSCREEN",
    "_NET_WM_STATE_HIDDEN",
    "_GTK_APPLICATION_ID",
    "_GTK_APPLICATION_OBJECT_PATH",
    "_GTK_UNIQUE_BUS_NAME",
    "_GTK_WINDOW_OBJECT_PATH",
};
// clang-format on

/// Properties of the root window that tell of the windows.
constexpr Atom kWatched[] = {NetActiveWindow, NetClientList, NetClientListStacking};

/// Events that are taken in at a time: of a flood a part, so that the loop's other sources have their turn.
constexpr int kMostEvents = 256;

xcb_connection_t* sConnection = nullptr;
base::Owned<base::Source> sSource;
/// There may be events that xcb has read already: they do not show on the descriptor.
bool sHasMore = false;
Changes sChanges;
/// The server has let a wait run out: it counts as gone.
bool sHangs = false;
/// The turn in which a connection was last tried.
std::optional<std::uint64_t> sTried;
xcb_window_t sRoot = XCB_NONE;
std::array<xcb_atom_t, kAtomCount> sAtoms{};

void loseConnection() {
  if (sSource != nullptr) {
    HostRunLoopRemoveSource(HostRunLoopCurrent(), HostSourceRef(sSource.get()), HostRunLoopMode::Default);
    sSource.reset();
  }
  if (sConnection != nullptr) xcb_disconnect(sConnection);
  sConnection = nullptr;
  sHangs = false;
}

bool isHealthy() { return sConnection != nullptr && !sHangs && xcb_connection_has_error(sConnection) == 0; }

/// Whether a server lets us in before long. xcb would wait for its greeting for ever, so a child tries first.
bool serverAnswers() {
  auto [reading, writing] = base::makePipe();
  if (!reading) return false;
  const pid_t child = fork();
  if (child < 0) return false;
  if (child == 0) {
    const bool answers = xcb_connection_has_error(xcb_connect(nullptr, nullptr)) == 0;
    _exit(answers && write(writing.get(), "", 1) == 1 ? 0 : 1);
  }
  writing = base::FileDescriptor();
  char byte = 0;
  const base::Deadline deadline(system::kQueryLimit);
  const bool answered = base::waitFor(reading.get(), POLLIN, deadline) && read(reading.get(), &byte, 1) == 1;
  kill(child, SIGKILL);
  while (waitpid(child, nullptr, 0) < 0 && errno == EINTR) continue;
  return answered;
}

xcb_window_t rootOf(xcb_connection_t* server, int screen) {
  xcb_screen_iterator_t screens = xcb_setup_roots_iterator(xcb_get_setup(server));
  for (int i = 0; i < screen && screens.rem > 1; ++i) xcb_screen_next(&screens);
  return screens.rem > 0 ? screens.data->root : XCB_NONE;
}

/// Asks for everything that stays as it is for the life of the connection.
bool introduce() {
  // Once a later reply has come, xcb knows the extensions and need not wait for them.
  xcb_prefetch_extension_data(sConnection, &xcb_randr_id);
  xcb_prefetch_extension_data(sConnection, &xcb_res_id);
  constexpr std::uint32_t kEvents[] = {XCB_EVENT_MASK_PROPERTY_CHANGE};
  xcb_change_window_attributes(sConnection, sRoot, XCB_CW_EVENT_MASK, kEvents);
  std::array<xcb_intern_atom_cookie_t, kAtomCount> cookies{};
  for (std::size_t i = 0; i < kAtomCount; ++i) {
    const std::string_view name = kAtomNames[i];
    cookies[i] = xcb_intern_atom(sConnection, 0, static_cast<std::uint16_t>(name.size()), name.data());
  }
  for (std::size_t i = 0; i < kAtomCount; ++i) {
    const auto reply = await<xcb_intern_atom_reply_t>(cookies[i]);
    sAtoms[i] = reply != nullptr ? reply->atom : xcb_atom_t{XCB_ATOM_NONE};
  }
  if (!isHealthy()) return false;
  // The versions say which requests the server understands of us.
  if (hasRandr()) {
    await<xcb_randr_query_version_reply_t>(xcb_randr_query_version(sConnection, 1, 5));
  }
  if (hasResource()) {
    await<xcb_res_query_version_reply_t>(xcb_res_query_version(sConnection, 1, 2));
  }
  return isHealthy();
}

void takeInEvents() {
  int taken = 0;
  while (taken < kMostEvents) {
    const Owned<xcb_generic_event_t> event{xcb_poll_for_event(sConnection)};
    if (event == nullptr) break;
    ++taken;
    const int type = event->response_type & 0x7F;  // the highest bit says that a program sent it
    if (type == XCB_MAPPING_NOTIFY) ++sChanges.keyboard;
    if (type != XCB_PROPERTY_NOTIFY) continue;
    const xcb_atom_t changed = reinterpret_cast<const xcb_property_notify_event_t*>(event.get())->atom;
    const bool ofWindows = std::any_of(std::begin(kWatched), std::end(kWatched),
                                       [&](Atom watched) { return changed == atom(watched); });
    if (ofWindows) ++sChanges.windows;
  }
  sHasMore = taken == kMostEvents;
  if (!isHealthy()) loseConnection();
}

void putOnLoop() {
  sHasMore = true;
  sSource =
      base::Owned<base::Source>(new base::Source(xcb_get_file_descriptor(sConnection), 0, takeInEvents));
  sSource->prepare = [] { return sHasMore; };
  HostRunLoopAddSource(HostRunLoopCurrent(), HostSourceRef(sSource.get()), HostRunLoopMode::Default);
}

bool connectToDisplay() {
  if (std::getenv("DISPLAY") == nullptr || !serverAnswers()) return false;
  int screen = 0;
  sConnection = xcb_connect(nullptr, &screen);
  sRoot = isHealthy() ? rootOf(sConnection, screen) : XCB_NONE;
  if (sRoot != XCB_NONE && introduce()) {
    putOnLoop();
    ++sChanges.windows;
    ++sChanges.keyboard;
    return true;
  }
  loseConnection();
  return false;
}

}  // namespace

xcb_connection_t* connection() {
  if (sConnection != nullptr) takeInEvents();
  if (sConnection == nullptr && sTried != base::turn()) {
    sTried = base::turn();
    if (!connectToDisplay() && takeSessionEnvironment()) connectToDisplay();
  }
  return sConnection;
}

void disconnect() { loseConnection(); }

const Changes& changes() { return sChanges; }

xcb_window_t root() { return sRoot; }

xcb_atom_t atom(Atom name) { return sAtoms[name]; }

bool hasRandr() {
  const auto* const data = xcb_get_extension_data(sConnection, &xcb_randr_id);
  return data != nullptr && data->present != 0;
}

bool hasResource() {
  const auto* const data = xcb_get_extension_data(sConnection, &xcb_res_id);
  return data != nullptr && data->present != 0;
}

void* awaitReply(unsigned sequence) {
  if (!isHealthy()) return nullptr;
  xcb_flush(sConnection);
  const base::Deadline deadline(system::kQueryLimit);
  while (true) {
    void* reply = nullptr;
    xcb_generic_error_t* error = nullptr;
    if (xcb_poll_for_reply(sConnection, sequence, &reply, &error) != 0) {
      std::free(error);
      return reply;
    }
    if (base::waitFor(xcb_get_file_descriptor(sConnection), POLLIN, deadline)) continue;
    sHangs = true;
    sTried = base::turn();
    return nullptr;
  }
}

xcb_get_property_cookie_t askProperty(xcb_window_t window, xcb_atom_t name) {
  return xcb_get_property(sConnection, 0, window, name, XCB_GET_PROPERTY_TYPE_ANY, 0, kLongestProperty / 4);
}

Numbers::Numbers(xcb_get_property_cookie_t cookie) : reply_(await<xcb_get_property_reply_t>(cookie)) {
  if (reply_ == nullptr || reply_->format != 32) return;
  values_ = {static_cast<const std::uint32_t*>(xcb_get_property_value(reply_.get())), reply_->value_len};
}

bool Numbers::contains(std::uint32_t value) const {
  return std::find(values_.begin(), values_.end(), value) != values_.end();
}

std::string awaitText(xcb_get_property_cookie_t cookie) {
  const auto reply = await<xcb_get_property_reply_t>(cookie);
  if (reply == nullptr || reply->format != 8) return {};
  return {static_cast<const char*>(xcb_get_property_value(reply.get())), reply->value_len};
}

}  // namespace linux::windows::x11
