#include "platform/linux/windows/wayland/keyboard.h"

#include <sys/mman.h>
#include <wayland-client.h>

#include <ctime>
#include <set>
#include <utility>

#include "platform/base/file_descriptor.h"
#include "platform/linux/windows/wayland/keymap.h"
#include "platform/linux/windows/wayland/seat.h"
#include "virtual_keyboard.h"

namespace linux::windows::wayland {

namespace {

zwp_virtual_keyboard_manager_v1* sManager = nullptr;
zwp_virtual_keyboard_v1* sKeyboard = nullptr;
std::map<std::uint32_t, Place> sPlaces;
/// The keys that are down.
std::set<std::uint32_t> sDown;

bool canBeMade() { return sManager != nullptr && seat() != nullptr; }

std::uint32_t milliseconds() {
  timespec time{};
  clock_gettime(CLOCK_MONOTONIC, &time);
  return static_cast<std::uint32_t>(time.tv_sec * 1000 + time.tv_nsec / 1'000'000);
}

}  // namespace

void takeKeyboards(const Offer& offer) {
  if (sManager != nullptr) return;
  sManager = static_cast<zwp_virtual_keyboard_manager_v1*>(
      accept(offer, zwp_virtual_keyboard_manager_v1_interface, 1));
}

void dropKeyboards() {
  pullOutKeyboard();
  if (sManager != nullptr) zwp_virtual_keyboard_manager_v1_destroy(sManager);
  sManager = nullptr;
}

void plugInKeyboard() {
  if (!canBeMade()) return;
  Keymap keymap = makeKeymap();
  // xkb's text ends with a NUL on the wire.
  const std::size_t size = keymap.text.size() + 1;
  const base::FileDescriptor file(memfd_create("keymap", MFD_CLOEXEC));
  if (keymap.places.empty() || !base::writeAll(file, {keymap.text.c_str(), size})) return;
  sKeyboard = zwp_virtual_keyboard_manager_v1_create_virtual_keyboard(sManager, seat());
  zwp_virtual_keyboard_v1_keymap(sKeyboard, WL_KEYBOARD_KEYMAP_FORMAT_XKB_V1, file.get(),
                                 static_cast<std::uint32_t>(size));
  sPlaces = std::move(keymap.places);
}

void pullOutKeyboard() {
  if (sKeyboard != nullptr) zwp_virtual_keyboard_v1_destroy(sKeyboard);
  sKeyboard = nullptr;
  sDown.clear();
}

bool reachesFront() { return keysAreWanted() ? sKeyboard != nullptr : canBeMade(); }

bool tapKey(std::uint32_t keysym, bool down, Modifiers modifiers) {
  const auto place = sPlaces.find(keysym);
  if (sKeyboard == nullptr || place == sPlaces.end()) return false;
  const std::uint32_t key = place->second.key;
  if (!down && sDown.erase(key) == 0) return false;
  if (down) {
    sDown.insert(key);
    zwp_virtual_keyboard_v1_modifiers(sKeyboard, maskOf(place->second.modifiers | modifiers), 0, 0, 0);
  }
  zwp_virtual_keyboard_v1_key(sKeyboard, milliseconds(), key,
                              down ? WL_KEYBOARD_KEY_STATE_PRESSED : WL_KEYBOARD_KEY_STATE_RELEASED);
  if (!down) zwp_virtual_keyboard_v1_modifiers(sKeyboard, 0, 0, 0, 0);
  return true;
}

}  // namespace linux::windows::wayland
