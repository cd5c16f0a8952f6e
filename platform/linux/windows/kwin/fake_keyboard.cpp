#include "platform/linux/windows/kwin/fake_keyboard.h"

#include <linux/input-event-codes.h>
#include <sys/mman.h>
#include <wayland-client.h>

#include <map>
#include <utility>

#include "fake_input.h"
#include "platform/base/file_descriptor.h"
#include "platform/linux/windows/wayland/keymap.h"
#include "platform/linux/windows/wayland/seat.h"

namespace linux::windows::kwin {

namespace {

using wayland::Place;

/// A layout of that size would be some hundred times larger than any there is.
constexpr std::uint32_t kLargestKeymap = 8 << 20;

constexpr std::pair<Modifier, std::uint32_t> kModifierKeys[] = {
    {kShift, KEY_LEFTSHIFT},
    {kControl, KEY_LEFTCTRL},
    {kAlt, KEY_LEFTALT},
};

org_kde_kwin_fake_input* sInput = nullptr;
/// The seat's own, of which nothing is wanted but its layout.
wl_keyboard* sKeyboard = nullptr;
std::map<std::uint32_t, Place> sPlaces;
/// The keys that are down, each with the modifiers that went down with it.
std::map<std::uint32_t, Modifiers> sDown;

void readKeymap(void*, wl_keyboard*, std::uint32_t format, int descriptor, std::uint32_t size) {
  const base::FileDescriptor file(descriptor);
  if (format != WL_KEYBOARD_KEYMAP_FORMAT_XKB_V1 || size == 0 || size > kLargestKeymap) return;
  void* const text = mmap(nullptr, size, PROT_READ, MAP_PRIVATE, file.get(), 0);
  if (text == MAP_FAILED) return;
  auto places = wayland::placesIn({static_cast<const char*>(text), size});
  if (!places.empty()) sPlaces = std::move(places);
  munmap(text, size);
}

template <typename... Arguments>
void ignore(void*, Arguments...) {}

constexpr wl_keyboard_listener kListener{
    .keymap = readKeymap,
    .enter = ignore,
    .leave = ignore,
    .key = ignore,
    .modifiers = ignore,
    .repeat_info = ignore,
};

void send(std::uint32_t key, bool down) {
  org_kde_kwin_fake_input_keyboard_key(sInput, key,
                                       down ? WL_KEYBOARD_KEY_STATE_PRESSED : WL_KEYBOARD_KEY_STATE_RELEASED);
}

void sendModifiers(Modifiers modifiers, bool down) {
  for (const auto& [modifier, key] : kModifierKeys) {
    if ((modifiers & modifier) != 0) send(key, down);
  }
}

}  // namespace

void takeFakeInput(const wayland::Offer& offer) {
  if (sInput != nullptr || offer.version < ORG_KDE_KWIN_FAKE_INPUT_KEYBOARD_KEY_SINCE_VERSION) return;
  sInput = static_cast<org_kde_kwin_fake_input*>(wayland::accept(
      offer, org_kde_kwin_fake_input_interface, ORG_KDE_KWIN_FAKE_INPUT_KEYBOARD_KEY_SINCE_VERSION));
  org_kde_kwin_fake_input_authenticate(sInput, "kvd", "The buttons of a media remote");
}

void dropFakeInput() {
  if (sKeyboard != nullptr) wl_keyboard_destroy(sKeyboard);
  // Its destructor is of a later version.
  if (sInput != nullptr) wl_proxy_destroy(reinterpret_cast<wl_proxy*>(sInput));
  sKeyboard = nullptr;
  sInput = nullptr;
  sDown.clear();
}

void prepareKeyboard() {
  if (sInput == nullptr) return;
  if (!wayland::seatHasKeyboard()) {
    sPlaces = wayland::makeKeymap().places;
    return;
  }
  sKeyboard = wl_seat_get_keyboard(wayland::seat());
  wl_keyboard_add_listener(sKeyboard, &kListener, nullptr);
}

bool hasKeyboard() { return sInput != nullptr; }

bool tapKey(std::uint32_t keysym, bool down, Modifiers modifiers) {
  const auto place = sPlaces.find(keysym);
  if (sInput == nullptr || place == sPlaces.end()) return false;
  const std::uint32_t key = place->second.key;
  if (down) {
    const Modifiers held = place->second.modifiers | modifiers;
    if (!sDown.try_emplace(key, held).second) return true;
    sendModifiers(held, true);
    send(key, true);
    return true;
  }
  const auto pressed = sDown.find(key);
  if (pressed == sDown.end()) return false;
  send(key, false);
  sendModifiers(pressed->second, false);
  sDown.erase(pressed);
  return true;
}

}  // namespace linux::windows::kwin
