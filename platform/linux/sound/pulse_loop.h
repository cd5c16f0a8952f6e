// libpulse's events on kvd's own run loop.
//
// libpulse asks for three kinds of events: a descriptor is ready, a time has come, and "soon". Its
// descriptors stand in an epoll set of their own behind one source of the run loop; the earliest of its times
// is one timer; what is to be done soon makes the source ready by itself. Where an answer must be had now, a
// wait serves these events and no others: the run loop stands still meanwhile.
#pragma once

#include <pulse/mainloop-api.h>

#include <functional>

#include "platform/base/deadline.h"

namespace linux::sound {

/// What libpulse is given to live on. Borrowed; it lives as long as the process.
pa_mainloop_api& pulseLoop();

/// Serves libpulse's events until `done` says so or the deadline has passed; what is ready already is always
/// served. Returns what `done` said last.
bool servePulse(const std::function<bool()>& done, const base::Deadline& deadline);

/// Serves the events of libpulse that are ready, without waiting.
void servePulse();

}  // namespace linux::sound
