// The on-screen text with which a player answers the remote.
#pragma once

#include "platform/linux/roles/performer.h"

namespace linux::roles {

/// Shows what the performer plays and where it stands: in its own on-screen text where it has a channel for
/// that, else in a desktop notification that takes the place of the one before. Never fails and hardly waits.
void showRemoteHUD(const Performer& performer);

}  // namespace linux::roles
