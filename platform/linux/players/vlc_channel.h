// VLC's remote control interface ("rc"): lines of text over a Unix socket.
//
// VLC opens it where its settings or command line say so ("--extraintf oldrc --rc-unix PATH"). The socket is
// found through the process that listens on it, whatever its path. It serves one client at a time, so that a
// connection lasts for one exchange.
#pragma once

#include <sys/types.h>

#include <optional>
#include <string>
#include <string_view>

namespace desktop {

/// Whether the process is a VLC that has opened the interface.
bool hasVlcChannel(pid_t process);

/// Carries out a command line ("key key-nav-up"). Throws tarnscript::Refusal where nobody takes it.
void vlcCommand(pid_t process, std::string_view line);

/// One of so many: titles count from 1 and chapters from 0.
struct VlcPlace {
  int number = 0;
  int count = 0;
};

/// The title that plays: 0 of several while a disc shows a menu; 0 of 1 or none for a plain file. While VLC
/// is paused it does not tell: then as it told last. Nothing when it never has.
std::optional<VlcPlace> vlcTitle(pid_t process);

/// The chapter that plays, told as the title is.
std::optional<VlcPlace> vlcChapter(pid_t process);

}  // namespace desktop
