// The connection to the compositor: made, lost and made again, and never waited for longer than a question
// may take.
//
// It is on the run loop, as a compositor drops those who do not read.
#pragma once

#include <sys/types.h>

struct wl_display;
struct wl_seat;

namespace linux::windows::wlr {

/// The connection, with what has come taken in; made anew where it was lost (at most once a turn of the run
/// loop). Null while there is none. Borrowed, until the next call.
wl_display* connection();

/// Closes it. Questions that come later open it again.
void disconnect();

/// The process of the compositor; 0 without one.
pid_t compositor();

/// The person's seat; null where there is none.
wl_seat* seat();

/// Sends what was asked for. False when the connection is gone.
bool flush();

}  // namespace linux::windows::wlr
