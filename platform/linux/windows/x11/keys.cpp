#include "platform/linux/windows/x11/keys.h"

#include <algorithm>
#include <ctime>
#include <iterator>
#include <optional>
#include <utility>
#include <vector>

#include "platform/linux/windows/x11/connection.h"

namespace linux::windows::x11 {

namespace {

/// Which key makes which symbol. A key has a row of symbols: its plain and its Shift one for the first
/// keyboard layout, then the two for the second.
struct Keyboard {
  xcb_keycode_t first = 0;
  std::size_t perKey = 0;
  std::vector<xcb_keysym_t> symbols;
  /// changes().keyboard when it was read.
  unsigned changes = 0;
};

Keyboard sKeyboard;

void readKeyboard(xcb_connection_t* server) {
  if (sKeyboard.changes == changes().keyboard) return;
  sKeyboard = {};
  const xcb_setup_t* const setup = xcb_get_setup(server);
  const auto count = static_cast<std::uint8_t>(setup->max_keycode - setup->min_keycode + 1);
  const auto reply =
      await<xcb_get_keyboard_mapping_reply_t>(xcb_get_keyboard_mapping(server, setup->min_keycode, count));
  if (reply == nullptr) return;
  const xcb_keysym_t* const symbols = xcb_get_keyboard_mapping_keysyms(reply.get());
  sKeyboard.first = setup->min_keycode;
  sKeyboard.perKey = reply->keysyms_per_keycode;
  sKeyboard.symbols.assign(symbols, symbols + xcb_get_keyboard_mapping_keysyms_length(reply.get()));
  sKeyboard.changes = changes().keyboard;
}

/// A key and the modifiers that make it yield a symbol.
struct Place {
  xcb_keycode_t key = 0;
  std::uint16_t state = 0;
};

/// The second keyboard layout, in an event's state.
constexpr std::uint16_t kSecondLayout = 1 << 13;

constexpr std::pair<Modifier, std::uint16_t> kMasks[] = {
    {kShift, XCB_MOD_MASK_SHIFT},
    {kControl, XCB_MOD_MASK_CONTROL},
    {kAlt, XCB_MOD_MASK_1},
};

/// Modifiers as an event's state has them.
std::uint16_t stateOf(Modifiers modifiers) {
  std::uint16_t state = 0;
  for (const auto& [modifier, mask] : kMasks) {
    if ((modifiers & modifier) != 0) state |= mask;
  }
  return state;
}

std::optional<Place> placeOf(xcb_keysym_t symbol) {
  constexpr std::uint16_t kStates[] = {0, XCB_MOD_MASK_SHIFT, kSecondLayout,
                                       kSecondLayout | XCB_MOD_MASK_SHIFT};
  const std::size_t columns = std::min(std::size(kStates), sKeyboard.perKey);
  for (std::size_t column = 0; column < columns; ++column) {
    for (std::size_t i = column; i < sKeyboard.symbols.size(); i += sKeyboard.perKey) {
      if (sKeyboard.symbols[i] != symbol) continue;
      return Place{static_cast<xcb_keycode_t>(sKeyboard.first + i / sKeyboard.perKey), kStates[column]};
    }
  }
  return std::nullopt;
}

/// The X server's clock, in milliseconds. Programs that hold back keys that repeat too fast look at it, so
/// that a key without a time would be the last one they take. The coarse clock is never ahead of the
/// server's.
xcb_timestamp_t serverTime() {
  timespec time{};
  clock_gettime(CLOCK_MONOTONIC_COARSE, &time);
  return static_cast<xcb_timestamp_t>(time.tv_sec * 1000 + time.tv_nsec / 1'000'000);
}

}  // namespace

bool sendKey(std::uint64_t window, std::uint32_t keysym, bool down, Modifiers modifiers) {
  xcb_connection_t* const server = connection();
  if (server == nullptr) return false;
  readKeyboard(server);
  const auto place = placeOf(keysym);
  if (!place) return false;
  xcb_key_press_event_t event{};
  event.response_type = down ? XCB_KEY_PRESS : XCB_KEY_RELEASE;
  event.detail = place->key;
  event.time = serverTime();
  event.root = root();
  event.event = static_cast<xcb_window_t>(window);
  event.state = place->state | stateOf(modifiers);
  event.same_screen = 1;
  // With an event mask GTK programs let it fall; without one it goes to the program that made the window.
  const auto sent = xcb_send_event_checked(server, 0, event.event, XCB_EVENT_MASK_NO_EVENT,
                                           reinterpret_cast<const char*>(&event));
  // An answer to a later request says that the server is past this one, so that asking for its error need not
  // wait.
  const auto later = await<xcb_get_input_focus_reply_t>(xcb_get_input_focus(server));
  if (later == nullptr) return false;
  const Owned<xcb_generic_error_t> error(xcb_request_check(server, sent));
  return error == nullptr;
}

void activate(std::uint64_t window) {
  xcb_connection_t* const server = connection();
  if (server == nullptr) return;
  // Says that a pager asks, on behalf of the person: window managers refuse a program that pushes itself.
  constexpr std::uint32_t kFromPager = 2;
  xcb_client_message_event_t message{};
  message.response_type = XCB_CLIENT_MESSAGE;
  message.format = 32;
  message.window = static_cast<xcb_window_t>(window);
  message.type = atom(NetActiveWindow);
  message.data.data32[0] = kFromPager;
  message.data.data32[1] = serverTime();
  xcb_send_event(server, 0, root(), XCB_EVENT_MASK_SUBSTRUCTURE_NOTIFY | XCB_EVENT_MASK_SUBSTRUCTURE_REDIRECT,
                 reinterpret_cast<const char*>(&message));
  xcb_flush(server);
}

}  // namespace linux::windows::x11
