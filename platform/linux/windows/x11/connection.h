// The connection to the X server: made, lost and made again, and never waited for longer than a question may
// take.
//
// It is on the run loop, for the sake of the server, which keeps what nobody reads. What has changed is told
// by events; they are few, as only the root window's properties are watched.
#pragma once

#include <xcb/xcb.h>

#include <cstdint>
#include <cstdlib>
#include <memory>
#include <span>
#include <string>

namespace linux::windows::x11 {

/// The atoms in use, interned with each connection.
enum Atom : std::uint8_t {
  NetActiveWindow,
  NetClientList,
  NetClientListStacking,
  NetCurrentDesktop,
  NetWmDesktop,
  NetWmName,
  NetWmPid,
  NetWmState,
  NetWmStateFullscreen,
  NetWmStateHidden,
  GtkApplicationId,
  GtkApplicationObjectPath,
  GtkUniqueBusName,
  GtkWindowObjectPath,
  kAtomCount,
};

/// The connection, with the events that have come taken in; made anew where it was lost (at most once a turn
/// of the run loop). Null while there is none. Borrowed, until the next call.
xcb_connection_t* connection();

/// Counters that differ from what they were once something may have changed: the window manager's lists and
/// what it says is in front; which key makes which symbol. A new connection changes both.
struct Changes {
  unsigned windows = 0;
  unsigned keyboard = 0;
};
const Changes& changes();

/// Closes it. Questions that come later open it again.
void disconnect();

xcb_window_t root();
xcb_atom_t atom(Atom name);

/// Whether the server has the extension; asked for with the connection.
bool hasRandr();
bool hasResource();

struct Freer {
  void operator()(void* memory) const { std::free(memory); }
};
template <typename T>
using Owned = std::unique_ptr<T, Freer>;

/// Waits for a reply. Null when the request has failed; a server that does not answer in time loses its
/// connection, and everything else that is waited for is null at once.
void* awaitReply(unsigned sequence);

/// The reply to a request, as its own type: await<xcb_get_geometry_reply_t>(xcb_get_geometry(...)).
template <typename T, typename Cookie>
Owned<T> await(Cookie cookie) {
  return Owned<T>(static_cast<T*>(awaitReply(cookie.sequence)));
}

// Properties. Ask for all that is wanted first and read the answers then: that is one round trip.

/// The most that is read of one property, in bytes.
inline constexpr std::uint32_t kLongestProperty = 16384;

xcb_get_property_cookie_t askProperty(xcb_window_t window, xcb_atom_t name);

/// A property of 32-bit numbers (windows, atoms, cardinals); empty when it is missing or of another format.
class Numbers {
 public:
  explicit Numbers(xcb_get_property_cookie_t cookie);
  std::span<const std::uint32_t> values() const { return values_; }
  /// The first, or what is given where there is none.
  std::uint32_t first(std::uint32_t otherwise) const { return values_.empty() ? otherwise : values_.front(); }
  bool contains(std::uint32_t value) const;

 private:
  Owned<xcb_get_property_reply_t> reply_;
  std::span<const std::uint32_t> values_;
};

/// A property of bytes as it stands, NULs and all.
std::string awaitText(xcb_get_property_cookie_t cookie);

/// The bytes before the first NUL.
inline std::string firstText(const std::string& bytes) { return bytes.substr(0, bytes.find('\0')); }

}  // namespace linux::windows::x11
