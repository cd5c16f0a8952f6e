// Who may press keys.
#pragma once

#include <sys/types.h>

namespace receiver::pass_through {

/// The user at the other end of a local socket. Throws std::system_error where it is none.
uid_t peerOf(int connection);

/// Whether a user's keys may reach the screen: root's, and those of whoever has the session in front of
/// seat0, to which all devices belong that are made through uinput. False without logind.
bool mayPress(uid_t user);

}  // namespace receiver::pass_through
