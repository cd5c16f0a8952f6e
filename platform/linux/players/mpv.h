// mpv's own channel: commands and answers as lines of JSON over a Unix socket.
//
// mpv, or a program around it, opens it where its configuration says so ("input-ipc-server"). A connection
// lasts for one exchange. Commands are blank-separated words ("frame-step", "set pause yes").
#pragma once

#include "platform/linux/players/program_channel.h"

namespace linux::players {

extern const ProgramChannel kMpvChannel;

}  // namespace linux::players
