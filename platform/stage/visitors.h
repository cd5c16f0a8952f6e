// Messages that other processes send to the daemon of a rehearsal.
#pragma once

namespace stage {

/// From here on the journal tells them, and they are kept as the commands that would have sent them.
void watchVisitors();

/// Ends that.
void ignoreVisitors();

}  // namespace stage
