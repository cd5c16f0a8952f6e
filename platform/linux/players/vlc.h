// VLC's remote control interface ("rc"): lines of text over a Unix socket.
//
// VLC opens it where its settings or command line say so ("--extraintf oldrc --rc-unix PATH"). It serves one
// client at a time, so that a connection lasts for one exchange. Commands are lines ("key key-nav-up").
#pragma once

#include "platform/linux/players/program_channel.h"

namespace linux::players {

extern const ProgramChannel kVlcChannel;

}  // namespace linux::players
