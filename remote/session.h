// Whose daemon a button is for.
#pragma once

#include <string>

namespace remote {

/// Points the look-up of the daemon at the session of a user. Without a name it stays at one's own, but for
/// root without XDG_RUNTIME_DIR, who means the user at the screen, if there is one. Throws UsageError where
/// no user has the name.
void chooseSession(const std::string& user);

}  // namespace remote
