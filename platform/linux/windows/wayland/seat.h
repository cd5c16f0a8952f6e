// The person's seat: keyboard, pointer and what has the focus.
#pragma once

#include "platform/linux/windows/wayland/connection.h"

struct wl_seat;

namespace linux::windows::wayland {

/// Keeps the first that is offered.
void takeSeat(const Offer& offer);
void dropSeat();

/// Null where there is none.
wl_seat* seat();

bool seatHasKeyboard();

}  // namespace linux::windows::wayland
