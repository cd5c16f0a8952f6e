// The connection to the compositor, one for all back ends that speak to it: made, lost and made again, and
// never waited for longer than a question may take.
//
// It is on the run loop, as a compositor drops those who do not read.
#pragma once

#include <sys/types.h>

#include <cstdint>
#include <span>
#include <string>
#include <string_view>

struct wl_display;
struct wl_interface;
struct wl_registry;

namespace linux::windows::wayland {

/// Something that the compositor has to offer.
struct Offer {
  wl_registry* registry = nullptr;
  std::uint32_t name = 0;
  std::uint32_t version = 0;
};

/// Accepts it, in the newest version that both sides know. The proxy is the caller's.
void* accept(const Offer& offer, const wl_interface& interface, std::uint32_t newest);

/// What becomes of an offer of this interface.
struct Interest {
  std::string_view interface;
  void (*take)(const Offer& offer) = nullptr;
};

/// A back end's part in the connection.
struct Part {
  std::span<const Interest> interests;
  /// Whether this compositor tells it of windows.
  bool (*isTold)() = nullptr;
  /// There is a new connection, and all that there was has been told.
  void (*begin)() = nullptr;
  /// The connection is about to go: whatever is of it must be let go of. Called whether it had begun or not.
  void (*end)() = nullptr;
};

/// Gives a part its place behind those that have joined already; all that before the first connection.
void join(const Part& part);

/// Whether the compositor is spoken to in this way: the first of the parts that are told of windows is, so
/// that nobody tells of a window twice.
bool speaks(const Part& part);
/// Whether there is a connection, and the compositor tells no part of windows.
bool nobodySpeaks();

/// The connection, with what has come taken in; made anew where it was lost (at most once a turn of the run
/// loop). Null while there is none. Borrowed, until the next call.
wl_display* connection();

/// Why there is none, in a few words.
std::string obstacle();

/// Closes it. Questions that come later open it again.
void disconnect();

/// The process of the compositor; 0 without one.
pid_t compositor();

/// Sends what was asked for. False when the connection is gone.
bool flush();

}  // namespace linux::windows::wayland
