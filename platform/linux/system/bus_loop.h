// Connections to a bus on the run loop, whichever bus it is.
#pragma once

#include <systemd/sd-bus.h>

#include <functional>

#include "platform/base/deadline.h"
#include "platform/base/object.h"
#include "platform/base/run_loop.h"

namespace linux::system {

/// Has the run loop call `takeIn` when the connection has something to handle, until the source is taken off.
base::Owned<base::Source> putOnLoop(sd_bus* connection, std::function<void()> takeIn);

/// Takes it off; no source is as good.
void takeOffLoop(base::Owned<base::Source>& source);

/// Handles what has arrived, without waiting; of a flood a part, so that the loop's other sources have their
/// turn before the rest. False when the connection is lost.
bool handleArrived(sd_bus* connection);

/// Waits until there is something to handle. False when the deadline has passed first.
bool waitForArrival(sd_bus* connection, const base::Deadline& deadline);

}  // namespace linux::system
