#include "platform/linux/windows/wayland/seat.h"

#include <wayland-client.h>

namespace linux::windows::wayland {

namespace {

wl_seat* sSeat = nullptr;
bool sHasKeyboard = false;

constexpr wl_seat_listener kListener{
    .capabilities =
        [](void*, auto*, std::uint32_t capabilities) {
          sHasKeyboard = (capabilities & WL_SEAT_CAPABILITY_KEYBOARD) != 0;
        },
    .name = [](void*, auto*, const char*) {},
};

}  // namespace

void takeSeat(const Offer& offer) {
  if (sSeat != nullptr) return;
  sSeat = static_cast<wl_seat*>(accept(offer, wl_seat_interface, 1));
  wl_seat_add_listener(sSeat, &kListener, nullptr);
}

void dropSeat() {
  if (sSeat != nullptr) wl_seat_destroy(sSeat);
  sSeat = nullptr;
  sHasKeyboard = false;
}

wl_seat* seat() { return sSeat; }

bool seatHasKeyboard() { return sHasKeyboard; }

}  // namespace linux::windows::wayland
