// mpv's own channel: commands and answers as lines of JSON over a Unix socket.
//
// mpv opens it where its configuration says so ("input-ipc-server"). The socket is found through the process
// that listens on it, whatever its path. A connection lasts for one exchange.
#pragma once

#include <sys/types.h>

#include <optional>
#include <string>
#include <string_view>

namespace desktop {

/// Whether the process is an mpv, or a program around it, that has opened its channel.
bool hasMpvChannel(pid_t process);

/// Carries out a command, its words blank-separated ("frame-step", "set pause yes"); the last word that a
/// command takes may not hold blanks. Throws tarnscript::Refusal where mpv refuses or does not answer.
void mpvCommand(pid_t process, std::string_view command);

/// Shows a text over the picture for a moment. False where that cannot be done.
bool showMpvText(pid_t process, std::string_view text);

}  // namespace desktop
