#include "platform/linux/windows/wayland/connection.h"

#include <poll.h>
#include <unistd.h>
#include <wayland-client.h>

#include <algorithm>
#include <cerrno>
#include <cstdint>
#include <cstdlib>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/base/deadline.h"
#include "platform/base/file_descriptor.h"
#include "platform/base/run_loop.h"
#include "platform/host.h"
#include "platform/linux/system/local_socket.h"
#include "platform/linux/system/turn.h"
#include "platform/linux/windows/session.h"
#include "platform/linux/windows/wayland/keyboard.h"
#include "platform/linux/windows/wayland/outputs.h"
#include "platform/linux/windows/wayland/seat.h"

namespace linux::windows::wayland {

namespace {

/// What is read at a time, in the library's buffers of 4 KB: of a flood a part, so that the loop's other
/// sources have their turn.
constexpr int kMostReads = 16;

wl_display* sDisplay = nullptr;
pid_t sCompositor = 0;
wl_registry* sRegistry = nullptr;
base::Owned<base::Source> sSource;
/// The turn in which a connection was last tried.
std::optional<std::uint64_t> sTried;

std::vector<const Part*> sParts;

/// What every part may need.
constexpr Interest kShared[] = {
    {"wl_output", addOutput},
    {"wl_seat", takeSeat},
    {"zwp_virtual_keyboard_manager_v1", takeKeyboards},
};

void addGlobal(void*, wl_registry* registry, std::uint32_t name, const char* interface,
               std::uint32_t version) {
  const auto offerTo = [&](std::span<const Interest> interests) {
    for (const Interest& interest : interests) {
      if (interest.interface == interface) interest.take({registry, name, version});
    }
  };
  offerTo(kShared);
  for (const Part* const part : sParts) offerTo(part->interests);
}

constexpr wl_registry_listener kRegistryListener{
    .global = addGlobal,
    .global_remove = [](void*, auto*, std::uint32_t name) { removeOutput(name); },
};

template <typename Proxy>
void drop(Proxy*& proxy, void (*destroy)(Proxy*)) {
  if (proxy != nullptr) destroy(proxy);
  proxy = nullptr;
}

void loseConnection() {
  if (sSource != nullptr) {
    HostRunLoopRemoveSource(HostRunLoopCurrent(), HostSourceRef(sSource.get()), HostRunLoopMode::Default);
    sSource.reset();
  }
  for (const Part* const part : sParts) part->end();
  dropKeyboards();
  forgetOutputs();
  dropSeat();
  drop(sRegistry, wl_registry_destroy);
  drop(sDisplay, wl_display_disconnect);
  sCompositor = 0;
}

/// Takes in what has come, by one read. False when nothing has, and when the connection is gone.
bool readOnce() {
  while (wl_display_prepare_read(sDisplay) != 0) {
    if (wl_display_dispatch_pending(sDisplay) < 0) return false;
  }
  wl_display_flush(sDisplay);
  pollfd watched{.fd = wl_display_get_fd(sDisplay), .events = POLLIN, .revents = 0};
  if (poll(&watched, 1, 0) <= 0) {
    wl_display_cancel_read(sDisplay);
    return false;
  }
  return wl_display_read_events(sDisplay) == 0 && wl_display_dispatch_pending(sDisplay) >= 0;
}

bool isHealthy() { return wl_display_get_error(sDisplay) == 0; }

void takeInEvents() {
  for (int i = 0; i < kMostReads && readOnce(); ++i) continue;
  if (!isHealthy()) loseConnection();
}

/// Waits until the compositor has done all that it was asked for. False when it does not in time.
bool awaitAll(const base::Deadline& deadline) {
  bool done = false;
  const wl_callback_listener listener{
      .done = [](void* data, auto*, std::uint32_t) { *static_cast<bool*>(data) = true; }};
  wl_callback* const callback = wl_display_sync(sDisplay);
  wl_callback_add_listener(callback, &listener, &done);
  while (!done && isHealthy()) {
    if (!readOnce() && !base::waitFor(wl_display_get_fd(sDisplay), POLLIN, deadline)) break;
  }
  wl_callback_destroy(callback);
  return done;
}

std::string displayPath() {
  const char* const name = std::getenv("WAYLAND_DISPLAY");
  const char* const directory = std::getenv("XDG_RUNTIME_DIR");
  if (name == nullptr || *name == '/') return name != nullptr ? name : "";
  return std::string(directory != nullptr ? directory : "") + "/" + name;
}

void putOnLoop() {
  sSource = base::Owned<base::Source>(new base::Source(wl_display_get_fd(sDisplay), 0, takeInEvents));
  HostRunLoopAddSource(HostRunLoopCurrent(), HostSourceRef(sSource.get()), HostRunLoopMode::Default);
}

bool connectToCompositor() {
  const base::FileDescriptor socket = system::connectTo(displayPath());
  if (!socket) return false;
  sCompositor = system::listenerOf(socket.get());
  // The display closes its descriptor itself.
  sDisplay = wl_display_connect_to_fd(dup(socket.get()));
  if (sDisplay == nullptr) return false;
  sRegistry = wl_display_get_registry(sDisplay);
  wl_registry_add_listener(sRegistry, &kRegistryListener, nullptr);
  const system::Limit limit = system::patience(system::kQueryLimit);
  const base::Deadline deadline(limit);
  // First what there is, then what that tells of itself, then what it was asked for on being told.
  if (!awaitAll(deadline) || !awaitAll(deadline) || !awaitAll(deadline)) {
    if (deadline.hasPassed()) system::noteWaitInVain(limit);
    loseConnection();
    return false;
  }
  for (const Part* const part : sParts) part->begin();
  flush();
  putOnLoop();
  return true;
}

}  // namespace

void* accept(const Offer& offer, const wl_interface& interface, std::uint32_t newest) {
  return wl_registry_bind(offer.registry, offer.name, &interface, std::min(offer.version, newest));
}

void join(const Part& part) {
  if (std::ranges::find(sParts, &part) == sParts.end()) sParts.push_back(&part);
}

bool speaks(const Part& part) {
  const auto first = std::ranges::find_if(sParts, [](const Part* each) { return each->isTold(); });
  return first != sParts.end() && *first == &part;
}

bool nobodySpeaks() {
  return sDisplay != nullptr && std::ranges::none_of(sParts, [](const Part* each) { return each->isTold(); });
}

wl_display* connection() {
  if (sDisplay != nullptr) takeInEvents();
  if (sDisplay == nullptr && sTried != base::turn()) {
    sTried = base::turn();
    if (!connectToCompositor() && takeSessionEnvironment()) connectToCompositor();
  }
  return sDisplay;
}

std::string obstacle() {
  const std::string path = displayPath();
  return path.empty() ? "WAYLAND_DISPLAY is not set" : "no compositor lets us in at " + path;
}

void disconnect() { loseConnection(); }

pid_t compositor() { return sCompositor; }

bool flush() { return sDisplay != nullptr && (wl_display_flush(sDisplay) >= 0 || errno == EAGAIN); }

}  // namespace linux::windows::wayland
